#include "forms/view/paint/Raster.h"

#include <gtest/gtest.h>

namespace quendra::forms {

namespace {

using Argb = std::vector<std::uint32_t>;
constexpr std::uint32_t kInk = 0xFF112233;
const Colour kInkColour = Rgb(0x11, 0x22, 0x33);

} // namespace

TEST(Raster, Colours_of_controls_have_red_in_the_low_byte_and_those_of_pixels_in_the_third) {
  EXPECT_EQ(ArgbOf(Rgb(1, 2, 3)), 0xFF010203U);
  EXPECT_EQ(ArgbOf(Rgb(1, 2, 3), 0x80), 0x80010203U);
}

TEST(Raster, The_common_part_of_areas_is_empty_where_they_only_touch) {
  EXPECT_EQ(CommonPart({{0, 0}, {10, 10}}, {{5, 6}, {10, 10}}), (Area{{5, 6}, {5, 4}}));
  EXPECT_EQ(CommonPart({{0, 0}, {10, 10}}, {{10, 0}, {5, 5}}).extent.width, 0);
  EXPECT_EQ(CommonPart({{0, 0}, {10, 10}}, {{30, 0}, {5, 5}}).extent.width, 0);
}

TEST(Raster, Places_count_from_the_origin_and_nothing_leaves_the_clip) {
  Argb pixels(4 * 3);
  Raster raster(pixels, {4, 3}, {1, 1}, {{0, 0}, {2, 9}});

  raster.Fill({{-5, -5}, {20, 20}}, kInkColour);

  EXPECT_EQ(pixels, (Argb{0, 0, 0, 0, 0, kInk, kInk, 0, 0, kInk, kInk, 0}));
}

TEST(Raster, An_origin_outside_leaves_nothing_to_be_drawn) {
  Argb pixels(4);
  Raster raster(pixels, {2, 2}, {7, 0}, {{0, 0}, {9, 9}});

  raster.Fill({{0, 0}, {9, 9}}, kInkColour);

  EXPECT_EQ(raster.Clip().extent.width, 0);
  EXPECT_EQ(pixels, Argb(4));
}

TEST(Raster, Half_a_coverage_mixes_half_of_each_over_whatever_alpha_a_window_has) {
  Argb pixels{0x00FFFFFF};
  Raster raster(pixels, {1, 1}, {}, {{}, {1, 1}});

  raster.Blend(0, 0, 0xFF000000, 128);

  EXPECT_EQ(pixels[0], 0xFF7F7F7FU);
}

TEST(Raster, Over_what_is_seen_through_a_colour_stays_as_it_is_and_keeps_its_alpha) {
  Picture::Pixels picture{1, 1, {0}};

  Raster(picture).Blend(0, 0, 0xFF102030, 64);

  EXPECT_EQ(picture.argb[0], 0x40102030U);
}

TEST(Raster, Over_what_is_half_seen_through_both_have_their_part) {
  Picture::Pixels picture{1, 1, {0x80FF0000}};

  Raster(picture).Blend(0, 0, 0x800000FF);

  EXPECT_EQ(picture.argb[0] >> 24, 0xC0U);
  EXPECT_NEAR(static_cast<double>(picture.argb[0] & 0xFF), 170, 1);
  EXPECT_NEAR(static_cast<double>(picture.argb[0] >> 16 & 0xFF), 85, 1);
}

TEST(Raster, A_picture_is_put_in_its_place_as_far_as_it_is_within_the_clip) {
  const Picture::Pixels picture{2, 2, {0xFF000001, 0xFF000002, 0, 0xFF000004}};
  Argb pixels(2 * 2, 0xFFFFFFFF);
  Raster raster(pixels, {2, 2}, {}, {{}, {2, 2}});

  raster.Put(picture, {1, 0});
  raster.Put(picture, {-1, -1});

  EXPECT_EQ(pixels, (Argb{0xFF000004, 0xFF000001, 0xFFFFFFFF, 0xFFFFFFFF}));
}

} // namespace quendra::forms
