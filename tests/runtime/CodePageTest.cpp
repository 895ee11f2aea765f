#include "runtime/Text.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra {
namespace {

/// The upper half of the page as published, with the places that it leaves unassigned as the system maps
/// them.
constexpr std::array<char16_t, 128> kUpperHalf{
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x008A, 0x2039, 0x008C,
    0x008D, 0x008E, 0x008F, 0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014, 0x02DC, 0x2122,
    0x009A, 0x203A, 0x009C, 0x009D, 0x009E, 0x009F, 0x00A0, 0x00A1, 0x00A2, 0x00A3, 0x20AA, 0x00A5, 0x00A6,
    0x00A7, 0x00A8, 0x00A9, 0x00D7, 0x00AB, 0x00AC, 0x00AD, 0x00AE, 0x00AF, 0x00B0, 0x00B1, 0x00B2, 0x00B3,
    0x00B4, 0x00B5, 0x00B6, 0x00B7, 0x00B8, 0x00B9, 0x00F7, 0x00BB, 0x00BC, 0x00BD, 0x00BE, 0x00BF, 0x05B0,
    0x05B1, 0x05B2, 0x05B3, 0x05B4, 0x05B5, 0x05B6, 0x05B7, 0x05B8, 0x05B9, 0x05BA, 0x05BB, 0x05BC, 0x05BD,
    0x05BE, 0x05BF, 0x05C0, 0x05C1, 0x05C2, 0x05C3, 0x05F0, 0x05F1, 0x05F2, 0x05F3, 0x05F4, 0xF88D, 0xF88E,
    0xF88F, 0xF890, 0xF891, 0xF892, 0xF893, 0x05D0, 0x05D1, 0x05D2, 0x05D3, 0x05D4, 0x05D5, 0x05D6, 0x05D7,
    0x05D8, 0x05D9, 0x05DA, 0x05DB, 0x05DC, 0x05DD, 0x05DE, 0x05DF, 0x05E0, 0x05E1, 0x05E2, 0x05E3, 0x05E4,
    0x05E5, 0x05E6, 0x05E7, 0x05E8, 0x05E9, 0x05EA, 0xF894, 0xF895, 0x200E, 0x200F, 0xF896};

char16_t UnitOf(unsigned byte) { return byte < 128 ? static_cast<char16_t>(byte) : kUpperHalf[byte - 128]; }

TEST(CodePage, Each_of_the_256_bytes_has_its_published_character) {
  for (unsigned byte = 0; byte < 256; ++byte)
    EXPECT_EQ(FromCodePage(std::string(1, static_cast<char>(byte))), Text(1, UnitOf(byte)))
        << std::hex << byte;
}

TEST(CodePage, Each_of_the_256_characters_goes_back_to_its_byte) {
  for (unsigned byte = 0; byte < 256; ++byte)
    EXPECT_EQ(ToCodePage(Text(1, UnitOf(byte))), std::string(1, static_cast<char>(byte))) << std::hex << byte;
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
