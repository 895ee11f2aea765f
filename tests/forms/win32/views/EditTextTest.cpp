#include "forms/win32/views/EditText.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

TEST(EditText, Of_a_single_line_is_held_as_it_is_shown) {
  const Text value = u"a\tb\r\nc";
  const EditText text(value, EditText::Lines::One);

  EXPECT_EQ(text.Held(), u"a\u2409b\u240D\u240Ac");
  EXPECT_EQ(text.HeldPlace(5), 5);
  EXPECT_EQ(text.ValuePlace(5), 5);
}

TEST(EditText, Of_many_lines_has_two_characters_for_each_line_break_however_it_is_written) {
  const Text value = u"a\nb\r\nc";
  const EditText text(value, EditText::Lines::Many);

  EXPECT_EQ(text.Held(), u"a\r\nb\r\nc");
  EXPECT_EQ(text.HeldPlace(2), 3);
  EXPECT_EQ(text.HeldPlace(5), 6);
  EXPECT_EQ(text.ValuePlace(3), 2);
  EXPECT_EQ(text.ValuePlace(6), 5);
}

TEST(EditText, Places_beyond_the_text_are_its_end) {
  const Text value = u"ab\r\n";
  const EditText text(value, EditText::Lines::Many);

  EXPECT_EQ(text.HeldPlace(99), 4);
  EXPECT_EQ(text.ValuePlace(99), 4);
  EXPECT_EQ(text.HeldPlace(-1), 0);
  EXPECT_EQ(text.ValuePlace(-1), 0);
}

TEST(EditText,
     Of_marked_lines_has_a_sign_before_each_that_reads_from_right_to_left_and_the_others_among_them) {
  EXPECT_EQ(EditText(u"מטפל...\r\nabc (RAS)\r\n\r\nסוף", EditText::Lines::Marked).Held(),
            u"\u202Bמטפל...\r\n\u202Aabc (RAS)\r\n\r\n\u202Bסוף");
  EXPECT_EQ(EditText(u"abc\r\nסוף\r\n", EditText::Lines::Marked).Held(), u"abc\r\n\u202Bסוף\r\n");
  EXPECT_EQ(EditText(u"abc\r\n10 ms", EditText::Lines::Marked).Held(), u"abc\r\n10 ms");
}

TEST(EditText, Places_in_marked_lines_are_those_of_what_is_shown) {
  const Text value = u"אב\r\nc\r\n";
  const EditText text(value, EditText::Lines::Marked);
  ASSERT_EQ(text.Held(), u"\u202Bאב\r\n\u202Ac\r\n");

  EXPECT_EQ(text.HeldPlace(0), 1);
  EXPECT_EQ(text.HeldPlace(2), 3);
  EXPECT_EQ(text.HeldPlace(4), 6);
  EXPECT_EQ(text.HeldPlace(7), 9);
  for (const int place : {0, 1, 2, 4, 5, 7}) EXPECT_EQ(text.ValuePlace(text.HeldPlace(place)), place);
  EXPECT_EQ(text.ValuePlace(0), 0);
  EXPECT_EQ(text.ValuePlace(5), 4);
}

TEST(EditText, Harmful_signs_that_were_pasted_become_visible) {
  EXPECT_EQ(EditText::ValueOf(u"a\u202Eb\r\nc", true), u"a\uFFFDb\r\nc");
  EXPECT_EQ(EditText::ValueOf(u"a\u202Eb\tc", false), u"a\uFFFDb\u2409c");
}

} // namespace quendra::forms::win32
