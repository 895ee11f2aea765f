#include "platform/linux/keyboard/KeyboardLayoutNames.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {
namespace {

TEST(KeyboardLayoutNamesTest, A_keymap_has_its_published_number) {
  EXPECT_EQ(LayoutNameOfKeymap("Hebrew"), "0000040D");
  EXPECT_EQ(LayoutNameOfKeymap("Hebrew (lyx)"), "0000040D");
  EXPECT_EQ(LayoutNameOfKeymap("English (US)"), "00000409");
  EXPECT_EQ(LayoutNameOfKeymap("English (UK)"), "00000809");
  EXPECT_EQ(LayoutNameOfKeymap("Russian"), "00000419");
  EXPECT_EQ(LayoutNameOfKeymap("Arabic"), "00000401");
  EXPECT_EQ(LayoutNameOfKeymap("French"), "0000040C");
  EXPECT_EQ(LayoutNameOfKeymap("German"), "00000407");
}

TEST(KeyboardLayoutNamesTest, A_layouts_code_stands_for_its_usual_keymap) {
  EXPECT_EQ(LayoutNameOfCode("il"), "0000040D");
  EXPECT_EQ(LayoutNameOfCode("us"), "00000409");
  EXPECT_EQ(LayoutNameOfCode("gb"), "00000809");
}

TEST(KeyboardLayoutNamesTest, Any_other_layout_has_none) {
  // Other keys bear other letters than on the layout of that number.
  EXPECT_FALSE(LayoutNameOfKeymap("Hebrew (phonetic)"));
  for (const char* other : {"", "hebrew", "Hebrew ", "Klingon"}) EXPECT_FALSE(LayoutNameOfKeymap(other));
  for (const char* other : {"", "IL", "xx", "Hebrew"}) EXPECT_FALSE(LayoutNameOfCode(other));
}

} // namespace
} // namespace quendra::platform::linux_
