#include "forms/win32/drawing/Drawing.h"

#include "forms/win32/drawing/Fonts.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {

constexpr std::uint32_t kPaper = 0xFFFFFF;

/// A white sheet of 200 by 60 pixels.
class DrawingTest : public testing::Test {
 protected:
  DrawingTest() { drawing.Fill({{}, {200, 60}}, kWhite); }

  std::uint32_t At(int x, int y) {
    return surface.Pixels()[static_cast<std::size_t>(y * 200 + x)] & 0xFFFFFF;
  }
  /// The part that isn't white any more.
  Area Drawn() {
    Area drawn{{200, 60}, {}};
    Spot end{};
    for (int y = 0; y < 60; ++y)
      for (int x = 0; x < 200; ++x) {
        if (At(x, y) == kPaper) continue;
        drawn.corner = {std::min(drawn.corner.left, x), std::min(drawn.corner.top, y)};
        end = {std::max(end.left, x + 1), std::max(end.top, y + 1)};
      }
    drawn.extent = {end.left - drawn.corner.left, end.top - drawn.corner.top};
    return drawn;
  }

  static TextSetting RightToLeft(Side side) {
    TextSetting setting;
    setting.direction = Direction::RightToLeft;
    setting.side = side;
    return setting;
  }

  Surface surface{{200, 60}};
  Drawing drawing{surface, {}, {{}, {200, 60}}};
  Fonts fonts;
  HFONT font = fonts.FontOf({9, false, false}, {});
};

} // namespace

TEST_F(DrawingTest, A_filled_box_has_its_colour_within_and_nothing_outside) {
  drawing.Fill({{10, 5}, {3, 4}}, Rgb(1, 2, 3));

  EXPECT_EQ(At(10, 5), 0x010203U);
  EXPECT_EQ(At(12, 8), 0x010203U);
  EXPECT_EQ(Drawn(), (Area{{10, 5}, {3, 4}}));
}

TEST_F(DrawingTest, Places_are_those_of_the_inner_area_and_nothing_leaves_it) {
  Drawing inner = drawing.Within({{20, 10}, {30, 20}});
  inner.Fill({{-5, 5}, {100, 3}}, kBlack);
  inner.Text(u"MMMMMMMMMMMMMMMMMMMM", {{0, 8}, {200, 12}}, font, kBlack);

  const Area drawn = Drawn();
  EXPECT_EQ(drawn.corner, (Spot{20, 15}));
  EXPECT_EQ(drawn.Right(), 50);
  EXPECT_LE(drawn.Bottom(), 30);
}

TEST_F(DrawingTest, A_surface_that_holds_a_part_of_a_window_takes_that_part_alone) {
  Surface part({10, 10});
  Drawing shifted(part, {-30, -20}, {{30, 20}, {10, 10}});

  shifted.Fill({{35, 20}, {100, 1}}, kRed);

  EXPECT_EQ(part.Pixels()[4], 0U);
  EXPECT_EQ(part.Pixels()[5] & 0xFFFFFF, 0xFF0000U);
  EXPECT_EQ(part.Pixels()[10], 0U);
}

TEST_F(DrawingTest, A_round_box_has_its_border_within_it_and_leaves_its_corners_alone) {
  drawing.RoundRect({{10, 10}, {40, 30}}, 6, kGreen, kRed);

  EXPECT_EQ(At(10, 10), kPaper);
  EXPECT_EQ(At(10, 25), 0xFF0000U);
  EXPECT_EQ(At(49, 25), 0xFF0000U);
  EXPECT_EQ(At(30, 25), 0x008000U);
  EXPECT_EQ(Drawn(), (Area{{10, 10}, {40, 30}}));
  const std::uint32_t smooth = At(12, 11);
  EXPECT_NE(smooth, kPaper);
  EXPECT_NE(smooth, 0xFF0000U);
}

TEST_F(DrawingTest, Level_lines_are_sharp_and_hold_both_ends) {
  drawing.Line({10, 20}, {30, 20}, kBlack, 1);

  EXPECT_EQ(Drawn(), (Area{{10, 20}, {21, 1}}));
  EXPECT_EQ(At(10, 20), 0U);
}

TEST_F(DrawingTest, A_text_read_from_right_to_left_stands_at_the_right_edge) {
  drawing.Text(u"שלום", {{0, 0}, {200, 60}}, font, kBlack, RightToLeft(Side::Right));

  const Area drawn = Drawn();
  EXPECT_GT(drawn.extent.width, 10);
  EXPECT_GE(drawn.Right(), 196);
  EXPECT_GT(drawn.corner.left, 150);
}

TEST_F(DrawingTest, A_point_behind_a_Hebrew_text_stands_at_its_left) {
  drawing.Text(u"שלום", {{0, 0}, {150, 60}}, font, kBlack, RightToLeft(Side::Right));
  const Area letters = Drawn();
  drawing.Fill({{}, {200, 60}}, kWhite);

  drawing.Text(u"שלום.", {{0, 0}, {150, 60}}, font, kBlack, RightToLeft(Side::Right));

  EXPECT_LT(Drawn().corner.left, letters.corner.left);
  EXPECT_EQ(Drawn().Right(), letters.Right());
}

TEST_F(DrawingTest, A_point_behind_a_Latin_text_stands_at_its_right) {
  TextSetting setting;
  drawing.Text(u"path", {{50, 0}, {150, 60}}, font, kBlack, setting);
  const Area letters = Drawn();
  drawing.Fill({{}, {200, 60}}, kWhite);

  drawing.Text(u"path.", {{50, 0}, {150, 60}}, font, kBlack, setting);

  EXPECT_EQ(Drawn().corner.left, letters.corner.left);
  EXPECT_GT(Drawn().Right(), letters.Right());
}

TEST_F(DrawingTest, A_text_is_drawn_in_its_colour_with_each_ampersand) {
  drawing.Text(u"&&&", {{0, 0}, {200, 60}}, fonts.FontOf({30, true, false}, {}), Rgb(200, 0, 0));

  EXPECT_GT(Drawn().extent.width, 60);
  bool seen = false;
  for (int x = 0; x < 200; ++x) seen |= At(x, 30) == 0xC80000;
  EXPECT_TRUE(seen);
}

TEST_F(DrawingTest, A_text_that_is_too_long_is_cut_with_an_ellipsis) {
  drawing.Text(u"iiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiii", {{10, 0}, {50, 60}}, font, kBlack);

  const Area drawn = Drawn();
  EXPECT_LE(drawn.Right(), 61);
  EXPECT_GT(drawn.Right(), 45);
  // Its last third is three points, which have nothing above the foot of the letters.
  bool high = false;
  for (int y = drawn.corner.top; y < drawn.Bottom() - 3; ++y) high |= At(drawn.Right() - 2, y) != kPaper;
  EXPECT_FALSE(high);
}

TEST_F(DrawingTest, A_text_that_wraps_stands_on_as_many_lines_as_it_needs) {
  const Text words = u"one two three four five six seven";
  TextSetting setting;
  setting.wraps = true;
  setting.fromTop = true;

  drawing.Text(words, {{0, 0}, {80, 60}}, font, kBlack, setting);

  const int line = fonts.LineHeight(font);
  EXPECT_GT(Drawn().Bottom(), 2 * line);
  EXPECT_LE(Drawn().Right(), 81);
  EXPECT_EQ(MeasureText(words, font, 80).height % line, 0);
  EXPECT_GE(MeasureText(words, font, 80).height, 3 * line);
}

TEST_F(DrawingTest, Several_lines_stand_half_way_down) {
  TextSetting setting;
  setting.wraps = true;

  drawing.Text(u"M\nM", {{0, 0}, {80, 60}}, font, kBlack, setting);

  const Area drawn = Drawn();
  EXPECT_NEAR(drawn.corner.top, 60 - drawn.Bottom(), 5);
}

TEST_F(DrawingTest, An_underlined_text_reaches_lower_and_a_bold_one_further) {
  drawing.Text(u"eeee", {{}, {200, 60}}, font, kBlack);
  const Area plain = Drawn();
  drawing.Fill({{}, {200, 60}}, kWhite);
  drawing.Text(u"eeee", {{}, {200, 60}}, fonts.FontOf({9, false, true}, {}), kBlack);
  EXPECT_GT(Drawn().Bottom(), plain.Bottom());
  drawing.Fill({{}, {200, 60}}, kWhite);
  drawing.Text(u"eeee", {{}, {200, 60}}, fonts.FontOf({9, true, false}, {}), kBlack);

  EXPECT_GT(Drawn().extent.width, plain.extent.width);
}

TEST_F(DrawingTest, A_picture_covers_what_lies_below_as_far_as_its_alpha_says) {
  const Bitmap bitmap{3, 1, {0xFF0000FF, 0x8000FF00, 0x00FF0000}};

  drawing.Picture(bitmap, {{5, 5}, {3, 1}});

  EXPECT_EQ(At(5, 5), 0x0000FFU);
  EXPECT_EQ(At(6, 5), 0x7FFF7FU);
  EXPECT_EQ(At(7, 5), kPaper);
}

TEST_F(DrawingTest, A_picture_is_scaled_to_its_area) {
  drawing.Picture({1, 1, {0xFF102030}}, {{5, 5}, {20, 10}});

  EXPECT_EQ(Drawn(), (Area{{5, 5}, {20, 10}}));
  EXPECT_EQ(At(24, 14), 0x102030U);
}

TEST_F(DrawingTest, What_the_system_drew_and_what_we_draw_lie_over_each_other_in_order) {
  drawing.Text(u"MMMM", {{}, {200, 60}}, font, kBlack);
  drawing.Fill({{}, {200, 60}}, kWhite);
  EXPECT_EQ(Drawn().extent.width, -200);
  drawing.Text(u"MMMM", {{}, {200, 60}}, font, kBlack);

  EXPECT_GT(Drawn().extent.width, 20);
}

TEST_F(DrawingTest, A_part_of_a_surface_is_shown_at_the_same_place) {
  Surface screen({200, 60});
  drawing.Fill({{0, 0}, {200, 60}}, kRed);

  surface.ShowOn(screen.Dc(), {{10, 10}, {5, 5}});

  EXPECT_EQ(screen.Pixels()[10 * 200 + 10] & 0xFFFFFF, 0xFF0000U);
  EXPECT_EQ(screen.Pixels()[9 * 200 + 10] & 0xFFFFFF, 0U);
  EXPECT_EQ(screen.Pixels()[10 * 200 + 15] & 0xFFFFFF, 0U);
}

// A process has 16,384 handles of drawing objects at most.
TEST_F(DrawingTest, Any_number_of_drawings_leaves_no_handle_of_the_system_behind) {
  for (int i = 0; i < 17'000; ++i) {
    Surface other({4, 4});
    Drawing(other, {}, {{}, {4, 4}}).Text(u"i", {{}, {4, 4}}, font, kBlack);
    MeasureText(u"i", font);
    ASSERT_GT(fonts.LineHeight(font), 0);
  }
}

} // namespace quendra::forms::win32
