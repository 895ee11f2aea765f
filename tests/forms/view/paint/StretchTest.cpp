#include "forms/view/paint/Stretch.h"

#include <gtest/gtest.h>

namespace quendra::forms {

using Argb = std::vector<std::uint32_t>;

TEST(Stretch, One_colour_stays_that_colour_in_every_size) {
  const Picture::Pixels picture{3, 2, Argb(6, 0xFF336699)};
  for (const Extent extent : {Extent{1, 1}, Extent{7, 5}, Extent{2, 2}, Extent{3, 9}})
    EXPECT_EQ(Stretched(picture, extent).argb,
              Argb(static_cast<std::size_t>(extent.width * extent.height), 0xFF336699));
}

TEST(Stretch, Half_the_size_has_the_mean_of_its_pixels) {
  const Picture::Pixels picture = Stretched({2, 2, {0xFF000000, 0xFFFFFFFF, 0xFFFFFFFF, 0xFF000000}}, {1, 1});

  EXPECT_NEAR(static_cast<double>(picture.argb[0] & 0xFF), 127, 1);
  EXPECT_EQ(picture.argb[0] >> 24, 0xFFU);
}

TEST(Stretch, Each_pixel_has_its_part_in_a_small_result) {
  Picture::Pixels picture{64, 64, Argb(64 * 64, 0xFF000000)};
  for (std::size_t i = 0; i < picture.argb.size(); i += 2) picture.argb[i] = 0xFFFFFFFF;

  for (const std::uint32_t argb : Stretched(picture, {5, 5}).argb)
    EXPECT_NEAR(static_cast<double>(argb & 0xFF), 127, 12);
}

TEST(Stretch, What_is_seen_through_gives_no_colour) {
  const Picture::Pixels picture = Stretched({2, 1, {0x00FF0000, 0xFF0000FF}}, {1, 1});

  EXPECT_NEAR(static_cast<double>(picture.argb[0] >> 24), 127, 1);
  EXPECT_EQ(picture.argb[0] & 0xFFFFFF, 0x0000FFU);
}

TEST(Stretch, Corners_stay_at_their_corners_in_a_larger_result) {
  const Picture::Pixels picture = Stretched({2, 2, {0xFF000001, 0xFF0000FF, 0xFF00FF00, 0xFFFF0000}}, {8, 8});

  EXPECT_EQ(picture.argb[0], 0xFF000001U);
  EXPECT_EQ(picture.argb[7], 0xFF0000FFU);
  EXPECT_EQ(picture.argb[56], 0xFF00FF00U);
  EXPECT_EQ(picture.argb[63], 0xFFFF0000U);
}

TEST(Stretch, A_picture_with_fewer_pixels_than_it_says_gives_none) {
  EXPECT_TRUE(Stretched({100, 100, {1, 2, 3}}, {5, 5}).argb.empty());
  EXPECT_TRUE(Stretched({-1, 2, {1, 2, 3}}, {5, 5}).argb.empty());
  EXPECT_TRUE(Stretched({1, 1, {1}}, {0, 5}).argb.empty());
  EXPECT_FALSE(IsWhole({0, 0, {}}));
}

TEST(Stretch, A_picture_is_fitted_with_its_proportions) {
  EXPECT_EQ(FittedInto({64, 32}, {32, 32}), (Extent{32, 16}));
  EXPECT_EQ(FittedInto({16, 32}, {64, 64}), (Extent{32, 64}));
  EXPECT_EQ(FittedInto({2048, 1}, {32, 32}), (Extent{32, 1}));
}

} // namespace quendra::forms
