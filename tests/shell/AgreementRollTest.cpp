#include "shell/AgreementRoll.h"

#include "forms/headless/HeadlessDesktop.h"

#include <gtest/gtest.h>

namespace quendra::shell {
namespace {

/// Pictures of 100 by 250 pixels; letters are 8 by 16 on this desktop.
class RollForm : public forms::Form {
 public:
  RollForm() : Form(u"RollForm") {}
  void Design() override {
    for (forms::PictureBox* picture : {&picBackBuffer, &picBuffer, &picOut}) {
      picture->ScaleMode = forms::ScaleMode::Pixels;
      picture->Visible = false;
      picture->Move(0, 0, 100 * 15, 250 * 15);
    }
    ReDrawTimer.Enabled = false;
  }
  forms::PictureBox picBackBuffer{*this, u"picBackBuffer"};
  forms::PictureBox picBuffer{*this, u"picBuffer"};
  forms::PictureBox picOut{*this, u"picOut"};
  forms::Timer ReDrawTimer{*this, u"ReDrawTimer", 1, false};
};

class AgreementRollTest : public testing::Test {
 protected:
  AgreementRollTest() {
    desktop.Show(form);
    lines.Wrap(u"first\r\nsecond\r\nthird", 100, [](TextView) { return 1; });
    desktop.Calls.clear();
  }

  void Tick(int times = 1) {
    for (int i = 0; i < times; ++i) form.ReDrawTimer.Tick();
  }
  /// What was printed in the last picture that the user saw; boxes and copies are left out.
  std::vector<std::string> Prints() const {
    std::vector<std::string> prints;
    for (const std::string& drawing : desktop.DrawingOf(form.picOut))
      if (drawing.starts_with("Print ")) prints.push_back(drawing);
    return prints;
  }

  forms::headless::HeadlessDesktop desktop;
  RollForm form;
  AgreementWrap lines;
  AgreementRoll roll{desktop, {form.picOut, form.picBuffer, form.picBackBuffer}, form.ReDrawTimer, lines};

  void SetUp() override {
    form.ReDrawTimer.Tick = [this] { roll.Tick(); };
  }
};

TEST_F(AgreementRollTest, Showing_makes_the_three_pictures_visible_and_ticks_every_5_ms) {
  roll.Show();
  EXPECT_TRUE(form.picOut.Visible());
  EXPECT_TRUE(form.picBuffer.Visible());
  EXPECT_TRUE(form.picBackBuffer.Visible());
  EXPECT_EQ(form.ReDrawTimer.Interval(), 5);
  EXPECT_TRUE(form.ReDrawTimer.Enabled());
}

TEST_F(AgreementRollTest, Showing_works_in_pixels_whatever_the_buffer_was_set_to) {
  form.picBuffer.ScaleMode = forms::ScaleMode::Twips;
  roll.Show();
  EXPECT_EQ(form.picBuffer.ScaleMode, forms::ScaleMode::Pixels);
  EXPECT_EQ(roll.ScrollOffset(), 250);
}

TEST_F(AgreementRollTest, The_text_starts_below_the_lower_edge) {
  roll.Show();
  Tick();
  EXPECT_EQ(Prints(), (std::vector<std::string>{"Print 0,272 FFFFFF first", "Print 0,294 FFFFFF second",
                                                "Print 0,316 FFFFFF third"}));
}

TEST_F(AgreementRollTest, The_background_is_a_gradient_in_bands_of_5_pixels_with_153_at_the_lower_edge) {
  roll.Show();
  const std::vector<std::string>& bands = desktop.DrawingOf(form.picBackBuffer);
  ASSERT_EQ(bands.size(), 51U);
  // 765 / 250 = 3.06 a band: 0, 3.06, 6.12, ... 153.
  EXPECT_EQ(bands[0], "Box 0,-1 100,5 000000");
  EXPECT_EQ(bands[1], "Box 0,4 100,10 030303");
  EXPECT_EQ(bands[2], "Box 0,9 100,15 060606");
  EXPECT_EQ(bands[9], "Box 0,44 100,50 1C1C1C");
  EXPECT_EQ(bands[49], "Box 0,244 100,250 969696");
  EXPECT_EQ(bands[50], "Box 0,249 100,255 999999");
}

TEST_F(AgreementRollTest, A_picture_without_height_gets_no_background) {
  form.picBuffer.Move(0, 0, 1500, 0);
  roll.Show();
  EXPECT_TRUE(desktop.DrawingOf(form.picBackBuffer).empty());
}

TEST_F(AgreementRollTest, A_tick_draws_in_the_buffer_and_then_shows_it) {
  roll.Show();
  desktop.Calls.clear();
  Tick();
  const std::vector<std::string> expected{"picBuffer BitBlt 0,0 100x250 from picBackBuffer 0,0",
                                          "picBuffer Print 0,272 FFFFFF first",
                                          "picBuffer Print 0,294 FFFFFF second",
                                          "picBuffer Print 0,316 FFFFFF third",
                                          "picOut BitBlt 0,0 100x250 from picBuffer 0,0",
                                          "Refresh picOut"};
  EXPECT_EQ(desktop.Calls, expected);
}

TEST_F(AgreementRollTest, The_text_moves_by_one_pixel_a_tick_whatever_the_time) {
  roll.Show();
  Tick();
  EXPECT_EQ(roll.ScrollOffset(), 249);
  desktop.Advance(0);
  Tick();
  EXPECT_EQ(roll.ScrollOffset(), 248);
  // A slow machine: one tick comes where many were due, and moves the text no further for it.
  form.ReDrawTimer.Interval = 1000;
  desktop.Advance(1000);
  EXPECT_EQ(roll.ScrollOffset(), 247);
}

TEST_F(AgreementRollTest, The_roll_ends_when_the_first_line_is_above_5) {
  roll.Show();
  // y of line 1 is 22 + offset: 5 at an offset of -17, which is tick 268, and 4 one tick later.
  Tick(268);
  EXPECT_EQ(Prints().front(), "Print 0,5 FFFFFF first");
  EXPECT_TRUE(form.ReDrawTimer.Enabled());
  Tick();
  EXPECT_EQ(Prints().front(), "Print 0,4 FFFFFF first");
  EXPECT_FALSE(form.ReDrawTimer.Enabled());
}

TEST_F(AgreementRollTest, The_text_stands_still_after_the_roll) {
  roll.Show();
  desktop.Advance(269 * 5);
  EXPECT_FALSE(form.ReDrawTimer.Enabled());
  const auto standing = Prints();
  desktop.Advance(10000);
  EXPECT_EQ(Prints(), standing);
  EXPECT_EQ(roll.ScrollOffset(), -19);
}

TEST_F(AgreementRollTest, Lines_below_the_lower_edge_of_a_long_text_never_come_into_view) {
  Text text;
  for (int line = 1; line < 20; ++line) text += u"line\r\n";
  lines.Wrap(text + u"last", 1000, [](TextView) { return 1; });
  roll.Show();
  desktop.Advance(10000);
  // Printed, but at 20 * 22 - 18, far below a picture of 250 pixels.
  EXPECT_EQ(Prints().back(), "Print 0,422 FFFFFF last");
  EXPECT_FALSE(form.ReDrawTimer.Enabled());
}

TEST_F(AgreementRollTest, Hiding_stops_a_roll_at_once_and_leaves_no_timer_running) {
  roll.Show();
  desktop.Advance(100);
  roll.Hide();
  EXPECT_FALSE(form.picOut.Visible());
  EXPECT_FALSE(form.picBuffer.Visible());
  EXPECT_FALSE(form.picBackBuffer.Visible());
  EXPECT_FALSE(form.ReDrawTimer.Enabled());
  const auto offset = roll.ScrollOffset();
  desktop.Advance(10000);
  EXPECT_EQ(roll.ScrollOffset(), offset);
}

TEST_F(AgreementRollTest, Showing_during_a_roll_starts_again_from_the_lower_edge) {
  roll.Show();
  desktop.Advance(500);
  EXPECT_EQ(roll.ScrollOffset(), 150);
  roll.Show();
  EXPECT_EQ(roll.ScrollOffset(), 250);
  EXPECT_TRUE(form.ReDrawTimer.Enabled());
}

TEST_F(AgreementRollTest, Showing_after_a_roll_starts_it_again) {
  roll.Show();
  desktop.Advance(10000);
  roll.Show();
  EXPECT_EQ(roll.ScrollOffset(), 250);
  EXPECT_TRUE(form.ReDrawTimer.Enabled());
}

} // namespace
} // namespace quendra::shell
