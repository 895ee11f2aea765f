#include "forms/win32/views/EditText.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

TEST(EditText, Of_a_single_line_is_held_as_it_is_shown) {
  const Text value = u"a\tb\r\nc";
  const EditText text(value, false);

  EXPECT_EQ(text.Held(), u"a\u2409b\u240D\u240Ac");
  EXPECT_EQ(text.HeldPlace(5), 5);
  EXPECT_EQ(text.ValuePlace(5), 5);
}

TEST(EditText, Of_many_lines_has_two_characters_for_each_line_break_however_it_is_written) {
  const Text value = u"a\nb\r\nc";
  const EditText text(value, true);

  EXPECT_EQ(text.Held(), u"a\r\nb\r\nc");
  EXPECT_EQ(text.HeldPlace(2), 3);
  EXPECT_EQ(text.HeldPlace(5), 6);
  EXPECT_EQ(text.ValuePlace(3), 2);
  EXPECT_EQ(text.ValuePlace(6), 5);
}

TEST(EditText, Places_beyond_the_text_are_its_end) {
  const Text value = u"ab\r\n";
  const EditText text(value, true);

  EXPECT_EQ(text.HeldPlace(99), 4);
  EXPECT_EQ(text.ValuePlace(99), 4);
  EXPECT_EQ(text.HeldPlace(-1), 0);
  EXPECT_EQ(text.ValuePlace(-1), 0);
}

TEST(EditText, Harmful_signs_that_were_pasted_become_visible) {
  EXPECT_EQ(EditText::ValueOf(u"a\u202Eb\r\nc", true), u"a\uFFFDb\r\nc");
  EXPECT_EQ(EditText::ValueOf(u"a\u202Eb\tc", false), u"a\uFFFDb\u2409c");
}

} // namespace quendra::forms::win32
