#include "forms/view/BoxContent.h"

#include "forms/MessageLoop.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

TEST(BoxContentTest, The_sign_follows_the_flags) {
  EXPECT_EQ(BoxContentOf(u"", kCritical, u"").sign, BoxSign::Critical);
  EXPECT_EQ(BoxContentOf(u"", kExclamation | kHebrewBox, u"").sign, BoxSign::Exclamation);
  EXPECT_EQ(BoxContentOf(u"", kInformation, u"").sign, BoxSign::Information);
  EXPECT_EQ(BoxContentOf(u"", kQuestion | kYesNo | kHebrewBox, u"").sign, BoxSign::Question);
  EXPECT_EQ(BoxContentOf(u"", 0x180034, u"").sign, BoxSign::Exclamation);
  EXPECT_EQ(BoxContentOf(u"", 0, u"").sign, BoxSign::None);
}

TEST(BoxContentTest, Each_line_of_a_box_that_reads_from_right_to_left_is_marked) {
  const BoxContent box = BoxContentOf(u"1: 10.0.0.5\n2: 10.0.0.138\n", kHebrewBox, u"");

  EXPECT_TRUE(box.rightToLeft);
  EXPECT_EQ(box.text, u"\u200F1: 10.0.0.5\n\u200F2: 10.0.0.138\n\u200F");
}

TEST(BoxContentTest, A_path_on_a_line_of_its_own_keeps_its_order_in_a_box_that_reads_from_right_to_left) {
  EXPECT_EQ(BoxContentOf(u"כאן:\r\n/usr/a-1\r\nסוף of", kHebrewBox, u"").text,
            u"\u200Fכאן:\n\u200F\u2066/usr/a-1\u2069\n\u200Fסוף of");
}

TEST(BoxContentTest, A_text_that_reads_from_left_to_right_stays_as_it_is) {
  const BoxContent box = BoxContentOf(u"a\nb", kExclamation | kRightAligned, u"");

  EXPECT_FALSE(box.rightToLeft);
  EXPECT_EQ(box.text, u"a\nb");
}

TEST(BoxContentTest, What_would_do_harm_is_made_visible_and_line_breaks_stay) {
  const BoxContent box = BoxContentOf(u"a\r\nb\u202Ec", 0, u"x\ny");

  EXPECT_EQ(box.text, u"a\nb\uFFFDc");
  EXPECT_EQ(box.title, u"x\u240Ay");
}

TEST(BoxContentTest, A_box_has_the_name_of_the_program_for_a_title_where_none_is_given) {
  EXPECT_EQ(BoxContentOf(u"text", 0, u"").title, u"Quendra");
}

TEST(BoxContentTest, No_more_is_shown_than_4096_units_and_an_ellipsis) {
  EXPECT_EQ(BoxContentOf(Text(4096, u'x'), 0, u"").text, Text(4096, u'x'));
  EXPECT_EQ(BoxContentOf(Text(4097, u'x'), 0, u"").text, Text(4096, u'x') + u'\u2026');
}

TEST(BoxContentTest, A_box_has_one_button_in_its_own_language_which_Escape_presses_too) {
  const BoxContent english = BoxContentOf(u"", kCritical, u"");
  EXPECT_EQ(english.buttons, (std::vector<BoxButton>{{1, u"OK"}}));
  EXPECT_EQ(english.defaultButton, 1);
  EXPECT_EQ(english.cancelButton, 1);

  EXPECT_EQ(BoxContentOf(u"", kHebrewBox, u"").buttons, (std::vector<BoxButton>{{1, u"אישור"}}));
}

TEST(BoxContentTest, A_question_has_two_buttons_and_Escape_presses_neither) {
  const BoxContent english = BoxContentOf(u"", kYesNo | kExclamation, u"");
  EXPECT_EQ(english.buttons, (std::vector<BoxButton>{{6, u"Yes"}, {7, u"No"}}));
  EXPECT_EQ(english.defaultButton, 6);
  EXPECT_EQ(english.cancelButton, 0);

  EXPECT_EQ(BoxContentOf(u"", kYesNo | kHebrewBox, u"").buttons,
            (std::vector<BoxButton>{{6, u"כן"}, {7, u"לא"}}));
}

} // namespace
} // namespace quendra::forms
