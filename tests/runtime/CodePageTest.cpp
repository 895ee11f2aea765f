#include "runtime/Text.h"

#include <gtest/gtest.h>

#include <iconv.h>

#include <map>
#include <optional>

namespace quendra {
namespace {

/// What the C library says that a byte of the page stands for, without composing a letter and its point;
/// nothing for a place that the page leaves unassigned.
std::optional<char16_t> UnitByIconv(unsigned byte) {
  const iconv_t converter = iconv_open("UTF-16LE", "CP1255");
  char in = static_cast<char>(byte);
  char* from = &in;
  std::size_t inLeft = 1;
  char16_t unit = 0;
  char* to = reinterpret_cast<char*>(&unit);
  std::size_t outLeft = sizeof unit;
  const bool known = iconv(converter, &from, &inLeft, &to, &outLeft) != static_cast<std::size_t>(-1);
  if (known) iconv(converter, nullptr, nullptr, &to, &outLeft);
  iconv_close(converter);
  return known ? std::optional(unit) : std::nullopt;
}

/// Where the system puts the places that the page leaves unassigned.
const std::map<unsigned, char16_t> kUnassigned{
    {0x81, 0x81},   {0x8A, 0x8A},   {0x8C, 0x8C},   {0x8D, 0x8D},   {0x8E, 0x8E},   {0x8F, 0x8F},
    {0x90, 0x90},   {0x9A, 0x9A},   {0x9C, 0x9C},   {0x9D, 0x9D},   {0x9E, 0x9E},   {0x9F, 0x9F},
    {0xCA, 0x05BA}, {0xD9, 0xF88D}, {0xDA, 0xF88E}, {0xDB, 0xF88F}, {0xDC, 0xF890}, {0xDD, 0xF891},
    {0xDE, 0xF892}, {0xDF, 0xF893}, {0xFB, 0xF894}, {0xFC, 0xF895}, {0xFF, 0xF896}};

char16_t UnitOf(unsigned byte) {
  const auto unassigned = kUnassigned.find(byte);
  return unassigned != kUnassigned.end() ? unassigned->second : UnitByIconv(byte).value_or(0);
}

TEST(CodePage, Each_of_the_256_bytes_has_its_published_character) {
  for (unsigned byte = 0; byte < 256; ++byte)
    EXPECT_EQ(FromCodePage(std::string(1, static_cast<char>(byte))), Text(1, UnitOf(byte)))
        << std::hex << byte;
}

TEST(CodePage, Each_of_the_256_characters_goes_back_to_its_byte) {
  for (unsigned byte = 0; byte < 256; ++byte)
    EXPECT_EQ(ToCodePage(Text(1, UnitOf(byte))), std::string(1, static_cast<char>(byte))) << std::hex << byte;
}

TEST(CodePage, The_C_library_leaves_the_same_places_unassigned) {
  for (unsigned byte = 0; byte < 256; ++byte)
    EXPECT_TRUE(UnitByIconv(byte).has_value() || kUnassigned.contains(byte)) << std::hex << byte;
}

TEST(CodePage, A_Hebrew_text_goes_there_and_back) {
  const Text title = u"זלמר בינלאומי@נט";

  const std::string bytes = ToCodePage(title);

  EXPECT_EQ(bytes, "\xE6\xEC\xEE\xF8 \xE1\xE9\xF0\xEC\xE0\xE5\xEE\xE9@\xF0\xE8");
  EXPECT_EQ(FromCodePage(bytes), title);
}

TEST(CodePage, What_the_page_lacks_becomes_a_question_mark) {
  EXPECT_EQ(ToCodePage(u"a\u00C9\u4E2Dz"), "a??z");
  EXPECT_EQ(ToCodePage(u"\U0001F600z"), "??z");
}

TEST(CodePage, Half_a_surrogate_pair_becomes_a_question_mark) {
  const Text lonely{u'a', char16_t{0xD83D}, u'b', char16_t{0xDE00}};

  EXPECT_EQ(ToCodePage(lonely), "a?b?");
}

TEST(CodePage, A_letter_and_its_point_stay_two_characters) {
  EXPECT_EQ(FromCodePage("\xF9\xD1"), (Text{0x05E9, 0x05C1}));
}

TEST(CodePage, A_NUL_is_a_character_like_any_other) {
  EXPECT_EQ(FromCodePage(std::string_view("a\0b", 3)), TextView(u"a\0b", 3));
  EXPECT_EQ(ToCodePage(TextView(u"a\0b", 3)), std::string("a\0b", 3));
}

} // namespace
} // namespace quendra
