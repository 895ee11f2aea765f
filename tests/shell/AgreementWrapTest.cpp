#include "shell/AgreementWrap.h"

#include "runtime/Fault.h"
#include "shell/Agreement.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::shell {
namespace {

/// Ten units a character.
int TenEach(TextView text) { return static_cast<int>(text.size()) * 10; }

std::vector<Text> Wrapped(TextView text, int limit, const AgreementWrap::TextWidth& width = TenEach) {
  AgreementWrap wrap;
  wrap.Wrap(text, limit, width);
  std::vector<Text> lines;
  for (int number = 1; number <= wrap.LineCount(); ++number) lines.push_back(wrap.Line(number));
  return lines;
}

using Lines = std::vector<Text>;

TEST(AgreementWrap, A_paragraph_that_fits_is_one_line) {
  EXPECT_EQ(Wrapped(u"abc def", 70), (Lines{u"abc def"}));
}

TEST(AgreementWrap, An_empty_paragraph_gives_one_empty_line) {
  EXPECT_EQ(Wrapped(u"ab\r\n\r\ncd", 70), (Lines{u"ab", u"", u"cd"}));
}

TEST(AgreementWrap, An_empty_text_gives_one_empty_line) { EXPECT_EQ(Wrapped(u"", 70), (Lines{u""})); }

TEST(AgreementWrap, Paragraphs_are_wrapped_each_by_itself_in_their_order) {
  EXPECT_EQ(Wrapped(u"one two three\r\nfour", 80), (Lines{u"one two ", u"three", u"four"}));
}

TEST(AgreementWrap, A_lone_carriage_return_or_line_feed_ends_no_paragraph) {
  EXPECT_EQ(Wrapped(u"a\rb\nc", 70), (Lines{u"a\rb\nc"}));
}

TEST(AgreementWrap, A_line_over_the_limit_ends_before_its_last_blank_and_the_rest_goes_back) {
  // "aaa bbb c" is over the limit with its ninth character; what follows the blank starts the next
  // line. That line is filled up to the limit, as the rest of the text fits by then, and ends in a blank.
  EXPECT_EQ(Wrapped(u"aaa bbb ccc ddd eee", 80), (Lines{u"aaa bbb", u"ccc ddd ", u"eee"}));
}

TEST(AgreementWrap, A_line_without_a_blank_is_stored_wider_than_the_limit) {
  // Nine characters where eight fit.
  EXPECT_EQ(Wrapped(u"abcdefghijklmnopqrst", 80), (Lines{u"abcdefghi", u"jklmnopq", u"rst"}));
}

TEST(AgreementWrap,
     A_rest_that_fits_while_the_line_is_short_is_filled_up_to_the_limit_and_cut_at_its_last_blank) {
  // After "aa bb" the rest "cc dd ee" fits; the line takes " cc" up to the limit and goes back to its blank.
  EXPECT_EQ(Wrapped(u"aa bb cc dd ee", 80), (Lines{u"aa bb", u"cc dd ee"}));
}

TEST(AgreementWrap, A_filled_line_that_ends_in_a_point_is_stored_with_the_rest_as_the_next_line) {
  EXPECT_EQ(Wrapped(u"aa bbbb. cc dd", 80), (Lines{u"aa bbbb.", u" cc dd"}));
}

TEST(AgreementWrap, A_filled_line_that_ends_in_a_blank_keeps_it) {
  EXPECT_EQ(Wrapped(u"aa bbbb cc dd", 80), (Lines{u"aa bbbb ", u"cc dd"}));
}

TEST(AgreementWrap, A_filled_line_without_a_blank_is_cut_where_the_limit_is) {
  EXPECT_EQ(Wrapped(u"abcdefghij", 80), (Lines{u"abcdefgh", u"ij"}));
}

TEST(AgreementWrap, A_filled_line_that_ends_in_a_line_break_character_is_stored_as_it_is) {
  EXPECT_EQ(Wrapped(u"aa bbbb\ncc ddd", 80), (Lines{u"aa bbbb\n", u"cc ddd"}));
}

TEST(AgreementWrap, A_width_at_the_limit_fits) { EXPECT_EQ(Wrapped(u"abcdefgh", 80), (Lines{u"abcdefgh"})); }

TEST(AgreementWrap, Widths_that_do_not_add_up_end_all_the_same) {
  // Everything is wide until nothing is left of the rest.
  const auto oddWidth = [](TextView text) { return text.size() > 3 ? 100 : 0; };
  EXPECT_EQ(Wrapped(u"abcdef", 50, oddWidth), (Lines{u"abcd", u"ef"}));
  const auto wideAsAWhole = [](TextView text) { return text == u"a bc" ? 100 : 1; };
  EXPECT_EQ(Wrapped(u"a bc", 50, wideAsAWhole), (Lines{u"a", u"bc"}));
}

TEST(AgreementWrap, A_limit_of_nothing_gives_a_line_for_each_character) {
  EXPECT_EQ(Wrapped(u"abc", 0), (Lines{u"a", u"b", u"c", u""}));
}

TEST(AgreementWrap, A_picture_too_narrow_for_any_text_ends_all_the_same) {
  EXPECT_EQ(Wrapped(u"ab", -20), (Lines{u"a", u"b", u""}));
  EXPECT_EQ(Wrapped(u"", -20), (Lines{u""}));
}

TEST(AgreementWrap, Lines_are_numbered_from_1) {
  AgreementWrap wrap;
  wrap.Wrap(u"only", 100, TenEach);
  EXPECT_EQ(wrap.LineCount(), 1);
  EXPECT_EQ(wrap.Line(1), u"only");
  EXPECT_THROW(wrap.Line(0), Fault);
  EXPECT_THROW(wrap.Line(2), Fault);
}

TEST(AgreementWrap, Wrapping_again_starts_anew) {
  AgreementWrap wrap;
  wrap.Wrap(u"one\r\ntwo", 100, TenEach);
  wrap.Wrap(u"three", 100, TenEach);
  EXPECT_EQ(wrap.LineCount(), 1);
  EXPECT_EQ(wrap.Line(1), u"three");
}

TEST(AgreementWrap, The_line_count_has_16_bits_and_one_line_more_overflows) {
  Text text;
  for (int line = 1; line < 32767; ++line) text += u"\r\n";
  AgreementWrap wrap;
  wrap.Wrap(text, 100, TenEach);
  EXPECT_EQ(wrap.LineCount(), 32767);

  text += u"\r\n";
  try {
    wrap.Wrap(text, 100, TenEach);
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kOverflow);
  }
}

TEST(Agreement, Joins_its_five_pieces_with_line_breaks) {
  EXPECT_EQ(
      AgreementText(),
      u"זלמר בינלאומי@נט\r\n____________________________\r\nהסכם שימוש בתוכנת הניטור והעזרה:\r\n"
      u"חברת זלמר בינלאומי בע\"מ מסירה מעצמה כל אחריות לנזקים העלולים להגרם כתוצאה משימוש בתוכנה זו.\r\n"
      u"הסרת אחריות זו כוללת גם באם השימוש נעשה באופן תקין ואפילו ע\"י ובהדרכת תומך או כל נציג אחר מטעם "
      u"זב\"ל");
}

TEST(Agreement, Underlines_its_title_with_28_underscores) {
  const Text text = AgreementText();
  EXPECT_EQ(std::count(text.begin(), text.end(), u'_'), 28);
}

} // namespace
} // namespace quendra::shell
