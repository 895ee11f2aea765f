#include "forms/view/VisibleText.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

TEST(VisibleText, Leaves_Hebrew_Latin_and_pairs_of_code_units_as_they_are) {
  const Text text = u"שלום, world 12.50 \U0001F600";

  EXPECT_EQ(VisibleText(text), text);
  EXPECT_EQ(VisibleText(u""), u"");
}

TEST(VisibleText, Shows_every_control_character_as_a_sign) {
  for (char16_t unit = 0; unit < 0x20; ++unit)
    EXPECT_EQ(VisibleText(Text(1, unit)), Text(1, static_cast<char16_t>(0x2400 + unit)));
  EXPECT_EQ(VisibleText(u"\x7F"), u"\u2421");
  for (char16_t unit = 0x80; unit < 0xA0; ++unit) EXPECT_EQ(VisibleText(Text(1, unit)), u"\uFFFD");
}

TEST(VisibleText, Shows_marks_that_hide_or_turn_the_reading_direction_as_signs) {
  const TextView marks = u"\u00AD\u061C\u200B\u200E\u200F\u2028\u202A\u202E\u2060\u2066\u2069\u206F\uFEFF";
  for (const char16_t mark : marks)
    EXPECT_EQ(VisibleText(Text(1, mark)), u"\uFFFD") << static_cast<int>(mark);
}

TEST(VisibleText, Shows_half_of_a_pair_as_a_sign_wherever_it_stands) {
  const Text high(1, char16_t{0xD83D});
  const Text low(1, char16_t{0xDE00});

  EXPECT_EQ(VisibleText(u"a" + high), u"a\uFFFD");
  EXPECT_EQ(VisibleText(low + u"a"), u"\uFFFDa");
  EXPECT_EQ(VisibleText(low + high), u"\uFFFD\uFFFD");
  EXPECT_EQ(VisibleText(high + high + low), u"\uFFFD" + high + low);
}

TEST(VisibleText, Keeps_line_breaks_where_there_is_more_than_one_line) {
  EXPECT_EQ(VisibleText(u"a\r\nb\tc", LineBreaks::Keep), u"a\nb\u2409c");
  EXPECT_EQ(VisibleText(u"a\r\nb"), u"a\u240D\u240Ab");
}

TEST(VisibleText, A_carriage_return_breaks_a_line_as_well_alone_as_with_a_line_feed) {
  EXPECT_EQ(VisibleText(u"a\r\rb\rc\r\n\r\nd", LineBreaks::Keep), u"a\n\nb\nc\n\nd");
}

TEST(VisibleText, Cuts_at_its_limit_with_an_ellipsis) {
  EXPECT_EQ(VisibleText(u"12345", LineBreaks::Show, 5), u"12345");
  EXPECT_EQ(VisibleText(u"123456", LineBreaks::Show, 5), u"12345\u2026");
  EXPECT_EQ(VisibleText(Text(4096, u'w')).size(), 1025U);
}

TEST(VisibleText, A_cut_through_a_pair_leaves_no_half_of_it) {
  EXPECT_EQ(VisibleText(u"1\U0001F600", LineBreaks::Show, 2), u"1\uFFFD\u2026");
}

TEST(TextDirection, Is_right_to_left_where_the_first_letter_is_Hebrew) {
  for (const TextView text : {u"שלום", u"תקשורת עם שרת Web", u"1: כתובת", u"(ת) x", u"\u2026 ת"})
    EXPECT_EQ(DirectionOf(text), Direction::RightToLeft);
}

TEST(TextDirection, Is_left_to_right_where_another_letter_comes_first) {
  for (const TextView text : {u"DNS תקשורת עם שרת", u"file שלום.exe", u"C:\\ת", u"é ת", u"Ω ת"})
    EXPECT_EQ(DirectionOf(text), Direction::LeftToRight);
}

TEST(TextDirection, Of_addresses_paths_and_numbers_is_their_own) {
  for (const TextView text : {u"C:\\Program Files (x86)", u".80.1025.", u"10.0.0.5", u""})
    EXPECT_EQ(DirectionOf(text), Direction::LeftToRight);
}

TEST(IsolatedText, Sets_Latin_data_apart_and_leaves_Hebrew_alone) {
  EXPECT_EQ(Isolated(u"eth0 (10.0.0.5)"), u"\u2066eth0 (10.0.0.5)\u2069");
  EXPECT_EQ(Isolated(u"כרטיס eth0"), u"כרטיס eth0");
  EXPECT_EQ(Isolated(u""), u"");
}

} // namespace
} // namespace quendra::forms
