#include "forms/view/paint/Shapes.h"

#include <gtest/gtest.h>

#include <cmath>
#include <numbers>

namespace quendra::forms {

namespace {

/// A white sheet of 40 by 40 pixels on which is drawn in black.
class Shapes : public testing::Test {
 protected:
  /// How much of 1 is covered.
  double At(int x, int y) const {
    return (255.0 - static_cast<double>(
                        pixels[static_cast<std::size_t>(y) * 40 + static_cast<std::size_t>(x)] & 0xFF)) /
           255;
  }
  double Covered() const {
    double sum = 0;
    for (int y = 0; y < 40; ++y)
      for (int x = 0; x < 40; ++x) sum += At(x, y);
    return sum;
  }

  std::vector<std::uint32_t> pixels = std::vector<std::uint32_t>(40 * 40, 0xFFFFFFFF);
  Raster raster{pixels, {40, 40}, {}, {{}, {40, 40}}};
};

} // namespace

TEST_F(Shapes, A_box_without_corners_covers_its_pixels_and_no_others) {
  FillRound(raster, RoundBox::Of({{5, 5}, {10, 6}}, 0), kBlack);

  EXPECT_EQ(Covered(), 60);
  EXPECT_EQ(At(5, 5), 1);
  EXPECT_EQ(At(14, 10), 1);
  EXPECT_EQ(At(4, 5), 0);
  EXPECT_EQ(At(15, 10), 0);
}

TEST_F(Shapes, A_round_corner_covers_a_quarter_of_a_circle) {
  FillRound(raster, RoundBox::Of({{0, 0}, {40, 40}}, 12), kBlack);

  EXPECT_EQ(At(0, 0), 0);
  EXPECT_EQ(At(12, 0), 1);
  EXPECT_NEAR(At(3, 3), 0.48, 0.02);
  EXPECT_NEAR(Covered(), 1600 - (4 - std::numbers::pi) * 144, 4);
}

TEST_F(Shapes, The_corners_are_alike) {
  FillRound(raster, RoundBox::Of({{0, 0}, {40, 40}}, 9), kBlack);

  for (int y = 0; y < 20; ++y)
    for (int x = 0; x < 20; ++x) {
      ASSERT_EQ(At(x, y), At(39 - x, y)) << x << ", " << y;
      ASSERT_EQ(At(x, y), At(x, 39 - y)) << x << ", " << y;
    }
}

TEST_F(Shapes, Half_a_pixel_is_covered_by_half) {
  FillRound(raster, {5, 5.5, 15, 10, 0}, kBlack);

  EXPECT_NEAR(At(10, 5), 0.5, 0.01);
  EXPECT_EQ(At(10, 6), 1);
}

TEST_F(Shapes, A_border_within_whole_pixels_is_a_sharp_line_of_one_pixel) {
  StrokeRound(raster, RoundBox::Of({{5, 5}, {20, 20}}, 4, 0.5), 1, kBlack);

  EXPECT_EQ(At(15, 5), 1);
  EXPECT_EQ(At(15, 6), 0);
  EXPECT_EQ(At(15, 4), 0);
  EXPECT_EQ(At(24, 15), 1);
  EXPECT_EQ(At(5, 5), 0);
  EXPECT_EQ(At(15, 15), 0);
}

TEST_F(Shapes, A_wide_line_lies_on_both_sides_of_the_edge) {
  StrokeRound(raster, RoundBox::Of({{10, 10}, {20, 20}}, 4), 2, kBlack);

  EXPECT_EQ(At(20, 9), 1);
  EXPECT_EQ(At(20, 10), 1);
  EXPECT_EQ(At(20, 8), 0);
  EXPECT_EQ(At(20, 11), 0);
}

TEST_F(Shapes, A_box_smaller_than_its_corners_is_a_circle) {
  FillRound(raster, RoundBox::Of({{10, 10}, {10, 10}}, 30), kBlack);

  EXPECT_NEAR(Covered(), std::numbers::pi * 25, 1.5);
}

TEST_F(Shapes, A_box_without_inside_draws_nothing) {
  FillRound(raster, RoundBox::Of({{10, 10}, {0, 0}}, 3), kBlack);
  FillRound(raster, {10, 10, 5, 5, 2}, kBlack);

  EXPECT_EQ(Covered(), 0);
}

TEST_F(Shapes, A_slanting_line_covers_its_length_by_its_width_with_square_ends) {
  StrokeLine(raster, {10, 10}, {30, 25}, 2, kBlack);

  EXPECT_NEAR(Covered(), (25 + 2) * 2, 2);
  EXPECT_GT(At(19, 17) + At(20, 17), 0.9);
  EXPECT_EQ(At(30, 10), 0);
}

TEST_F(Shapes, A_triangle_covers_half_of_its_box_in_either_order_of_its_corners) {
  FillTriangle(raster, {Point{10, 10}, Point{30, 10}, Point{20, 20}}, kBlack);
  const double oneWay = Covered();
  const std::vector<std::uint32_t> first = pixels;
  std::fill(pixels.begin(), pixels.end(), 0xFFFFFFFF);
  FillTriangle(raster, {Point{20, 20}, Point{30, 10}, Point{10, 10}}, kBlack);

  EXPECT_NEAR(oneWay, 100, 3);
  EXPECT_EQ(pixels, first);
}

} // namespace quendra::forms
