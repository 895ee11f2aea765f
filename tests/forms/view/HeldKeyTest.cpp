#include "forms/view/HeldKey.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

constexpr int kKey = 27;

TEST(HeldKey, A_press_at_the_very_moment_of_its_release_is_the_held_key_again) {
  HeldKey held;
  held.Released(kKey, 1500);

  EXPECT_TRUE(held.IsRepeatedBy(kKey, 1500));
}

TEST(HeldKey, A_later_press_or_another_key_is_a_press_of_its_own) {
  HeldKey held;
  held.Released(kKey, 1500);

  EXPECT_FALSE(held.IsRepeatedBy(kKey, 1501));
  EXPECT_FALSE(held.IsRepeatedBy(kKey + 1, 1500));
}

TEST(HeldKey, A_press_without_a_moment_is_a_press_of_its_own) {
  HeldKey held;
  held.Released(kKey, 0);

  EXPECT_FALSE(held.IsRepeatedBy(kKey, 0));
}

} // namespace
} // namespace quendra::forms
