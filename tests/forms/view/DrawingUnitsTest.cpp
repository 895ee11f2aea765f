#include "forms/view/DrawingUnits.h"

#include "forms/view/BareForm.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

/// A box of 100 by 50 pixels of 10 by 20 twips.
struct DrawingUnitsTest : testing::Test {
  DrawingUnitsTest() { box.Move(0, 0, 1000, 1000); }

  Scale screen{10, 20};
  BareForm form;
  PictureBox box{form, u"picBuffer"};
  DrawingUnits units{box, screen};
};

TEST_F(DrawingUnitsTest, Modes_have_the_published_numbers) {
  EXPECT_EQ(static_cast<int>(ScaleMode::Twips), 1);
  EXPECT_EQ(static_cast<int>(ScaleMode::Pixels), 3);
}

TEST_F(DrawingUnitsTest, A_new_box_counts_in_twips) {
  EXPECT_EQ(units.PixelsX(1000), 100);
  EXPECT_EQ(units.PixelsY(1000), 50);
  EXPECT_EQ(units.UnitsX(3), 30);
  EXPECT_EQ(units.UnitsY(3), 60);
  EXPECT_EQ(units.Width(), 1000);
  EXPECT_EQ(units.Height(), 1000);
}

TEST_F(DrawingUnitsTest, In_pixels_nothing_is_converted_but_the_box_itself) {
  box.ScaleMode = ScaleMode::Pixels;

  EXPECT_EQ(units.PixelsX(7), 7);
  EXPECT_EQ(units.PixelsY(-7), -7);
  EXPECT_EQ(units.UnitsX(7), 7);
  EXPECT_EQ(units.UnitsY(7), 7);
  EXPECT_EQ(units.Width(), 100);
  EXPECT_EQ(units.Height(), 50);
}

TEST_F(DrawingUnitsTest, A_filled_box_holds_both_its_corners_in_any_order) {
  box.ScaleMode = ScaleMode::Pixels;

  EXPECT_EQ(units.FilledBox(10, 20, 12, 22), (Area{{10, 20}, {3, 3}}));
  EXPECT_EQ(units.FilledBox(200, 4, -5, -1), (Area{{-5, -1}, {206, 6}}));
  box.ScaleMode = ScaleMode::Twips;
  EXPECT_EQ(units.FilledBox(100, 200, 120, 240), (Area{{10, 10}, {3, 3}}));
}

TEST_F(DrawingUnitsTest, A_printed_line_goes_on_to_the_right_edge) {
  form.RightToLeft = false;
  box.CurrentX = 300;
  box.CurrentY = 400;

  EXPECT_EQ(units.PrintedLine(16), (Area{{30, 20}, {70, 16}}));
}

TEST_F(DrawingUnitsTest, A_printed_line_of_a_mirrored_form_starts_8_pixels_off_the_right_edge) {
  box.CurrentX = 300;
  box.CurrentY = 400;

  EXPECT_EQ(units.PrintedLine(16), (Area{{0, 20}, {62, 16}}));
}

} // namespace
} // namespace quendra::forms
