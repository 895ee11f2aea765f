#include "forms/view/FrameLook.h"

#include "forms/view/BareForm.h"
#include "forms/view/Palette.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct FrameLook : testing::Test {
  FrameLook() { frame.Caption = Text(u" עקוב אחרי התקן "); }

  BareForm form;
  Frame frame{form, u"frame"};
};

TEST_F(FrameLook, The_title_is_the_caption_without_the_blanks_round_it) {
  EXPECT_EQ(TitleOf(frame), u"עקוב אחרי התקן");
}

TEST_F(FrameLook, A_frame_without_a_border_has_no_place_for_a_title) {
  frame.Border = false;

  EXPECT_EQ(TitleOf(frame), u"");
}

TEST_F(FrameLook, The_border_runs_through_the_middle_of_the_title) {
  EXPECT_DOUBLE_EQ(BorderTop(u"title", 17), 8.5);
  EXPECT_DOUBLE_EQ(BorderTop(u"", 17), 0);
}

TEST_F(FrameLook, The_title_stands_at_the_leading_edge) {
  EXPECT_EQ(TitlePlace({60, 16}, 200, Scale(), Direction::RightToLeft), (Area{{116, 0}, {72, 16}}));
  EXPECT_EQ(TitlePlace({60, 16}, 200, Scale(), Direction::LeftToRight), (Area{{12, 0}, {72, 16}}));
}

TEST_F(FrameLook, Is_as_much_smaller_as_its_form) {
  const Scale smaller = Scale().Zoomed(0.75);

  EXPECT_EQ(TitlePlace({45, 12}, 150, smaller, Direction::LeftToRight), (Area{{9, 0}, {54, 12}}));
  EXPECT_EQ(FrameCorner(Scale()), 8);
  EXPECT_EQ(FrameCorner(smaller), 6);
}

TEST_F(FrameLook, The_title_is_quiet_unless_the_form_gave_it_a_colour) {
  EXPECT_EQ(TitleInk(frame), Palette::QuietInk);
  frame.ForeColour = kRed;
  EXPECT_EQ(TitleInk(frame), kRed);
}

} // namespace
} // namespace quendra::forms
