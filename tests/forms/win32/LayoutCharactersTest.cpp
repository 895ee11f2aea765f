#include "forms/win32/input/LayoutCharacters.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {
HKL LayoutOf(UINT_PTR number) { return reinterpret_cast<HKL>(number); }
} // namespace

TEST(LayoutCharacters, Are_asked_for_once_a_layout_and_before_the_second_key_of_it) {
  int asked = 0;
  LayoutCharacters characters([&](UINT key, HKL layout) {
    ++asked;
    return static_cast<char16_t>(key + (layout == LayoutOf(2) ? 0x500 : 0));
  });
  EXPECT_EQ(characters.Of('A', LayoutOf(1)), u'A');
  const int afterFirst = asked;

  EXPECT_EQ(characters.Of('B', LayoutOf(1)), u'B');
  EXPECT_EQ(asked, afterFirst);
  EXPECT_EQ(characters.Of('A', LayoutOf(2)), u'\u0541');
  EXPECT_EQ(characters.Of('A', LayoutOf(1)), u'A');

  EXPECT_EQ(asked, 2 * afterFirst);
}

TEST(LayoutCharacters, A_key_that_no_layout_knows_gives_none) {
  LayoutCharacters characters([](UINT, HKL) { return u'x'; });

  EXPECT_EQ(characters.Of(0x100, LayoutOf(1)), u'\0');
}

} // namespace quendra::forms::win32
