#include "RecordingViewFixture.h"
#include "forms/Form.h"
#include "forms/controls/Controls.h"

#include <gtest/gtest.h>

#include <memory>

namespace quendra::forms {
namespace {

struct ControlTest : testing::Test {
  BareForm form;
  Frame frame{form, u"frameMain"};
  Label label{frame, u"main_lblUpload"};
  RecordingView view;
};

TEST_F(ControlTest, Attaching_pushes_the_whole_state_once) {
  label.Caption = u"before";

  label.Attach(&view);

  EXPECT_EQ(view.told, std::vector{Aspect::All});
  EXPECT_EQ(label.View(), &view);
}

TEST_F(ControlTest, A_write_that_changes_nothing_tells_nobody) {
  label.Caption = u"0.0";
  label.Attach(&view);
  view.told.clear();

  label.Caption = u"0.0";
  label.Visible = true;
  label.Enabled = true;
  label.ForeColour = kBlack;
  label.TextFont = Font{};
  label.Move(0, 0, 0, 0);
  label.Tag = Text{};

  EXPECT_TRUE(view.told.empty());
}

TEST_F(ControlTest, A_change_tells_its_aspect_once) {
  label.Attach(&view);
  view.told.clear();

  label.Caption = u"12.50";
  label.Visible = false;
  label.Enabled = false;
  label.Move(10, 20, 300, 40);
  label.ForeColour = kRed;
  label.TextFont = Font{12, true, false};
  label.Tag = u"x";
  label.Align = Alignment::Centre;

  EXPECT_EQ(view.told, (std::vector{Aspect::Caption, Aspect::Visible, Aspect::Enabled, Aspect::Geometry,
                                    Aspect::Colours, Aspect::Font, Aspect::Tag, Aspect::Look}));
}

TEST_F(ControlTest, Copying_a_property_of_another_control_copies_its_value) {
  Label other{frame, u"main_lblDownload"};
  other.Caption = u"7.00";
  label.Attach(&view);
  view.told.clear();

  label.Caption = other.Caption;

  EXPECT_EQ(label.Caption(), u"7.00");
  EXPECT_EQ(view.told, std::vector{Aspect::Caption});
}

TEST_F(ControlTest, A_detached_view_is_told_no_more) {
  label.Attach(&view);
  label.Attach(nullptr);
  view.told.clear();

  label.Caption = u"x";

  EXPECT_TRUE(view.told.empty());
}

TEST_F(ControlTest, A_view_learns_that_its_control_has_gone) {
  auto shortLived = std::make_unique<Label>(frame, u"lblShort");
  shortLived->Attach(&view);

  shortLived.reset();

  EXPECT_TRUE(view.gone);
}

TEST_F(ControlTest, A_view_that_goes_leaves_its_control_without_one) {
  {
    RecordingView shortLived;
    label.Attach(&shortLived);
  }

  label.Caption = u"nobody hears";

  EXPECT_EQ(label.View(), nullptr);
}

TEST_F(ControlTest, A_view_that_was_replaced_takes_nothing_with_it) {
  {
    RecordingView replaced;
    label.Attach(&replaced);
    label.Attach(&view);
  }

  EXPECT_EQ(label.View(), &view);
}

TEST_F(ControlTest, A_view_that_moves_to_another_control_leaves_the_first) {
  Label other{frame, u"other"};
  label.Attach(&view);
  other.Attach(&view);
  view.told.clear();

  label.Caption = u"x";
  other.Caption = u"y";

  EXPECT_EQ(view.told, std::vector{Aspect::Caption});
  EXPECT_EQ(label.View(), nullptr);
}

TEST_F(ControlTest, A_view_in_the_place_of_another_is_told_alone) {
  RecordingView second;
  label.Attach(&view);
  label.Attach(&second);
  view.told.clear();
  second.told.clear();

  label.Caption = u"x";

  EXPECT_TRUE(view.told.empty());
  EXPECT_EQ(second.told, std::vector{Aspect::Caption});
}

TEST_F(ControlTest, A_control_is_shown_while_it_and_all_its_containers_are_visible) {
  form.Visible = true;
  EXPECT_TRUE(label.IsShown());

  frame.Visible = false;
  EXPECT_FALSE(label.IsShown());
  EXPECT_TRUE(label.Visible());

  frame.Visible = true;
  form.Visible = false;
  EXPECT_FALSE(label.IsShown());
}

TEST_F(ControlTest, Bringing_to_the_front_makes_a_control_the_last_of_its_siblings) {
  Label second{frame, u"second"};
  label.Attach(&view);
  view.told.clear();

  label.BringToFront();
  label.BringToFront();

  EXPECT_EQ(frame.Children(), (std::vector<Control*>{&second, &label}));
  EXPECT_EQ(view.told, std::vector{Aspect::Order});
}

TEST_F(ControlTest, A_control_that_goes_leaves_its_container) {
  {
    Label shortLived{frame, u"lblShort"};
    EXPECT_EQ(frame.Children().size(), 2U);
  }
  EXPECT_EQ(frame.Children(), std::vector<Control*>{&label});
}

TEST_F(ControlTest, A_control_knows_its_form_through_all_its_containers) {
  EXPECT_EQ(&label.OwnerForm(), &form);
}

TEST(Event, Without_a_handler_nothing_happens) {
  Event<int> event;

  event(1);

  EXPECT_FALSE(event);
}

TEST(Event, A_handler_may_replace_itself_while_it_runs) {
  Event<> event;
  int first = 0;
  int second = 0;
  event = [&] {
    event = [&] { ++second; };
    ++first;
  };

  event();
  event();

  EXPECT_EQ(first, 1);
  EXPECT_EQ(second, 1);
}

TEST(Picture, Artwork_is_equal_by_name_and_pixels_by_identity) {
  const Picture pixels = Picture::Of({1, 1, {0xFF000000}});

  EXPECT_EQ(Picture::Artwork("menu0"), Picture::Artwork("menu0"));
  EXPECT_FALSE(Picture::Artwork("menu0") == Picture::Artwork("menu1"));
  EXPECT_EQ(pixels, Picture(pixels));
  EXPECT_FALSE(pixels == Picture::Of({1, 1, {0xFF000000}}));
  EXPECT_TRUE(Picture().IsNone());
}

TEST(Colour, Red_is_the_low_byte) {
  EXPECT_EQ(Rgb(255, 0, 0), kRed);
  EXPECT_EQ(Rgb(0, 128, 0), kGreen);
  EXPECT_EQ(Rgb(162, 233, 93), 162U + 233U * 256 + 93U * 65536);
}

} // namespace
} // namespace quendra::forms
