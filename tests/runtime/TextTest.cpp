#include "runtime/Text.h"

#include <gtest/gtest.h>

namespace quendra {
namespace {

TEST(Text, Utf8_of_one_to_four_bytes_goes_there_and_back) {
  const std::string bytes = "a\xC3\xA9\xD7\xA9\xE2\x82\xAC\xF0\x9F\x98\x80";
  const Text text = u"a\u00E9\u05E9\u20AC\U0001F600";

  EXPECT_EQ(FromUtf8(bytes), text);
  EXPECT_EQ(ToUtf8(text), bytes);
}

struct Malformed {
  const char* what;
  std::string bytes;
  Text text;
};

TEST(Text, Malformed_utf8_becomes_the_replacement_character) {
  const Malformed cases[] = {
      {"a lone continuation byte", "a\x80z", u"a\uFFFDz"},
      {"a lead byte at the end", "a\xD7", u"a\uFFFD"},
      {"a three-byte lead with one byte behind it", "\xE2\x82", u"\uFFFD\uFFFD"},
      {"an overlong slash", "\xC0\xAF", u"\uFFFD\uFFFD"},
      {"an overlong three-byte form", "\xE0\x80\xAF", u"\uFFFD\uFFFD\uFFFD"},
      {"half a surrogate pair", "\xED\xA0\x80", u"\uFFFD\uFFFD\uFFFD"},
      {"beyond the last code point", "\xF4\x90\x80\x80", u"\uFFFD\uFFFD\uFFFD\uFFFD"},
      {"bytes that never occur", "\xFE\xFF", u"\uFFFD\uFFFD"},
      {"a broken sequence before a letter", "\xE2\x28\xA1", u"\uFFFD(\uFFFD"},
  };
  for (const Malformed& malformed : cases)
    EXPECT_EQ(FromUtf8(malformed.bytes), malformed.text) << malformed.what;
}

TEST(Text, Half_a_surrogate_pair_leaves_as_the_replacement_character) {
  EXPECT_EQ(ToUtf8(Text{u'a', char16_t{0xD800}, u'b'}), "a\xEF\xBF\xBD"
                                                        "b");
  EXPECT_EQ(ToUtf8(Text{char16_t{0xDC00}}), "\xEF\xBF\xBD");
}

TEST(Text, Decimal_text_keeps_the_sign) {
  EXPECT_EQ(DecimalText(0), u"0");
  EXPECT_EQ(DecimalText(-15536), u"-15536");
  EXPECT_EQ(DecimalText(INT64_MAX), u"9223372036854775807");
  EXPECT_EQ(DecimalText(INT64_MIN), u"-9223372036854775808");
}

TEST(Text, Hexadecimal_text_has_capitals_and_no_leading_zeros) {
  EXPECT_EQ(HexText(0), u"0");
  EXPECT_EQ(HexText(0x5DD), u"5DD");
  EXPECT_EQ(HexText(0xFFFFFFFF), u"FFFFFFFF");
}

TEST(Text, Cutting_at_the_first_nul_drops_what_stands_behind_it) {
  EXPECT_EQ(CutAtNul(TextView(u"a\0b\0", 4)), u"a");
  EXPECT_EQ(CutAtNul(TextView(u"abc")), u"abc");
  EXPECT_EQ(CutAtNul(std::string_view("ab\0c", 4)), "ab");
  EXPECT_EQ(CutAtNul(std::string_view("\0", 1)), "");
}

TEST(Text, Trimming_takes_blanks_at_both_ends_and_nothing_else) {
  EXPECT_EQ(Trimmed(u"  a b \t "), u"a b \t");
  EXPECT_EQ(Trimmed(u"\u00A0a"), u"\u00A0a");
  EXPECT_EQ(Trimmed(u"   "), u"");
  EXPECT_EQ(Trimmed(u""), u"");
}

TEST(Text, Replacing_takes_every_occurrence_with_regard_to_case) {
  EXPECT_EQ(Replaced(u"Windows\u00AE a windows\u00AE b Windows\u00AE", u"Windows\u00AE", u""),
            u" a windows\u00AE b ");
  EXPECT_EQ(Replaced(u"aaa", u"aa", u"b"), u"ba");
  EXPECT_EQ(Replaced(u"aba", u"a", u"aa"), u"aabaa");
}

TEST(Text, Replacing_the_empty_text_changes_nothing) { EXPECT_EQ(Replaced(u"abc", u"", u"x"), u"abc"); }

TEST(Text, Only_Latin_letters_are_made_small) {
  EXPECT_EQ(Lowered(u"ABZ@[\u00C9\u05D0"), u"abz@[\u00C9\u05D0");
}

TEST(Text, Equality_without_case_looks_at_Latin_letters_alone) {
  EXPECT_TRUE(SameIgnoringCase(u"System", u"SYSTEM"));
  EXPECT_FALSE(SameIgnoringCase(u"\u00E9", u"\u00C9"));
  EXPECT_FALSE(SameIgnoringCase(u"abc", u"ab"));
}

TEST(Text, Padding_on_the_left_never_cuts) {
  EXPECT_EQ(PaddedLeft(u"40904E4", 8, u'0'), u"040904E4");
  EXPECT_EQ(PaddedLeft(u"123456789", 8, u'0'), u"123456789");
  EXPECT_EQ(PaddedLeft(u"", 2, u'0'), u"00");
}

} // namespace
} // namespace quendra
