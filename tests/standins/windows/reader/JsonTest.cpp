#include "standins/windows/reader/Json.h"

#include <gtest/gtest.h>

namespace quendra::standins {
namespace {

TEST(Json, A_text_of_plain_signs_is_itself) {
  EXPECT_EQ(Quoted(u""), R"("")");
  EXPECT_EQ(Quoted(u"a b/c' ~"), R"("a b/c' ~")");
}

TEST(Json, A_sign_that_would_end_the_text_or_its_line_is_told_by_its_number) {
  EXPECT_EQ(Quoted(u"\"\\"), R"("\u0022\u005c")");
  EXPECT_EQ(Quoted(u"\r\n\t\x1F\x7F"), R"("\u000d\u000a\u0009\u001f\u007f")");
  EXPECT_EQ(Quoted(Text(u"a\0b", 3)), R"("a\u0000b")");
}

TEST(Json, Letters_beyond_ASCII_and_halves_of_them_are_told_by_their_numbers) {
  EXPECT_EQ(Quoted(u"ש\x00E9"), R"("\u05e9\u00e9")");
  EXPECT_EQ(Quoted(u"\xD83D\xDE00"), R"("\ud83d\ude00")");
  EXPECT_EQ(Quoted(Text(1, char16_t{0xD83D})), R"("\ud83d")");
}

TEST(Json, Values_stand_in_a_list) {
  EXPECT_EQ(Listed({}), "[]");
  EXPECT_EQ(Listed({"1"}), "[1]");
  EXPECT_EQ(Listed({"[]", R"("")", "null"}), R"([[],"",null])");
}

} // namespace
} // namespace quendra::standins
