#include "forms/qt/QtFixture.h"

namespace quendra::forms::qt {

class Mouse : public QtFixture {
 protected:
  Mouse() {
    form.design = [this] { label.Move(0, 0, 1500, 450); };
  }

  Label label{form, u"label"};
};

TEST_F(Mouse, A_press_and_release_inside_a_label_click_it) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  desktop.Show(form);

  Click(WidgetOf(label));

  EXPECT_EQ(clicks, 1);
}

TEST_F(Mouse, A_release_outside_the_label_is_no_click) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  desktop.Show(form);

  PressMouse(WidgetOf(label), {1, 1});
  ReleaseMouse(WidgetOf(label), {1, 200});

  EXPECT_EQ(clicks, 0);
}

TEST_F(Mouse, The_right_button_presses_but_does_not_click) {
  int clicks = 0;
  int button = 0;
  label.Click = [&] { ++clicks; };
  label.MouseDown = [&](int pressed, int, int, int) { button = pressed; };
  desktop.Show(form);

  PressMouse(WidgetOf(label), {1, 1}, Qt::RightButton);
  ReleaseMouse(WidgetOf(label), {1, 1}, Qt::RightButton);

  EXPECT_EQ(button, kRightButton);
  EXPECT_EQ(clicks, 0);
}

TEST_F(Mouse, A_double_click_raises_its_event_behind_one_click) {
  std::string events;
  label.Click = [&] { events += 'c'; };
  label.DoubleClick = [&] { events += 'd'; };
  desktop.Show(form);

  Click(WidgetOf(label));
  DoubleClickMouse(WidgetOf(label), {1, 1});
  ReleaseMouse(WidgetOf(label), {1, 1});

  EXPECT_EQ(events, "cd");
}

TEST_F(Mouse, Two_quick_clicks_on_a_label_without_a_double_click_are_two_clicks) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  desktop.Show(form);

  Click(WidgetOf(label));
  DoubleClickMouse(WidgetOf(label), {1, 1});
  ReleaseMouse(WidgetOf(label), {1, 1});

  EXPECT_EQ(clicks, 2);
}

TEST_F(Mouse, Moves_come_with_the_held_button_and_the_place_in_twips_from_the_leading_edge) {
  std::array<int, 4> seen{};
  label.MouseMove = [&](int button, int shift, int x, int y) { seen = {button, shift, x, y}; };
  desktop.Show(form);

  MoveMouse(WidgetOf(label), {90, 4}, Qt::LeftButton);

  EXPECT_EQ(seen, (std::array<int, 4>{kLeftButton, kNoShift, 10 * kPixel, 4 * kPixel}));
}

TEST_F(Mouse, Moves_without_a_button_are_tracked) {
  int moves = 0;
  label.MouseMove = [&](int button, int, int, int) { moves += button == kNoButton; };
  desktop.Show(form);

  EXPECT_TRUE(WidgetOf(label).hasMouseTracking());
  MoveMouse(WidgetOf(label), {5, 5});

  EXPECT_EQ(moves, 1);
}

TEST_F(Mouse, A_transparent_label_on_a_picture_box_gets_its_own_events) {
  PictureBox box(form, u"PicMenu0");
  Label caption(box, u"lblCaption0");
  std::string events;
  box.MouseMove = [&](int, int, int, int) { events += 'b'; };
  box.Click = [&] { events += 'B'; };
  caption.MouseMove = [&](int, int, int, int) { events += 'l'; };
  caption.Click = [&] { events += 'L'; };
  form.design = [&] {
    box.Move(0, 0, 3000, 900);
    caption.Move(0, 0, 1500, 900);
  };
  desktop.Show(form);

  MoveMouse(WidgetOf(caption), {5, 5});
  Click(WidgetOf(caption));
  MoveMouse(WidgetOf(box), {5, 5});

  EXPECT_EQ(events, "lLb");
}

TEST_F(Mouse, A_disabled_label_hears_nothing) {
  int events = 0;
  label.Click = [&] { ++events; };
  label.MouseMove = [&](int, int, int, int) { ++events; };
  desktop.Show(form);
  label.Enabled = false;

  MoveMouse(WidgetOf(label), {5, 5});
  Click(WidgetOf(label));

  EXPECT_EQ(events, 0);
}

TEST_F(Mouse, The_hand_cursor_stays_until_the_mouse_moves_over_a_control_that_sets_none) {
  Label other(form, u"other");
  bool setsCursor = true;
  label.MouseMove = [&](int, int, int, int) {
    if (setsCursor) desktop.SetCursor(desktop.LoadCursor(32649));
  };
  desktop.Show(form);

  MoveMouse(WidgetOf(label), {5, 5});
  EXPECT_EQ(WidgetOf(label).cursor().shape(), Qt::PointingHandCursor);
  MoveMouse(WidgetOf(other), {5, 5});
  EXPECT_EQ(WidgetOf(other).cursor().shape(), Qt::ArrowCursor);
  setsCursor = false;
  MoveMouse(WidgetOf(label), {5, 5});
  EXPECT_EQ(WidgetOf(label).cursor().shape(), Qt::ArrowCursor);
}

TEST_F(Mouse, Only_system_cursors_have_handles) {
  EXPECT_NE(desktop.LoadCursor(32649), kNoCursor);
  EXPECT_EQ(desktop.LoadCursor(1), kNoCursor);
}

TEST_F(Mouse, A_caption_press_drags_the_window_where_no_window_manager_does) {
  desktop.Show(form);
  QWidget& window = WidgetOf(form);
  const QPoint before = window.pos();
  label.MouseMove = [&](int button, int, int, int) {
    if (button != kLeftButton) return;
    desktop.ReleaseCapture();
    desktop.SendMessage(desktop.HandleOf(form), 0xA1, 2, 0);
  };
  int clicks = 0;
  label.Click = [&] { ++clicks; };

  QCursor::setPos(WidgetOf(label).mapToGlobal(QPoint(10, 10)));
  PressMouse(WidgetOf(label), {10, 10});
  MoveMouse(WidgetOf(label), {10, 10}, Qt::LeftButton);
  MoveMouse(WidgetOf(label), {30, 25}, Qt::LeftButton);
  EXPECT_EQ(window.pos(), before + QPoint(20, 15));
  ReleaseMouse(WidgetOf(label), {10, 10});
  MoveMouse(WidgetOf(label), {50, 25});

  EXPECT_EQ(window.pos(), before + QPoint(20, 15));
  EXPECT_EQ(clicks, 0);
}

TEST_F(Mouse, The_release_that_ends_a_drag_is_no_click) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  label.MouseMove = [&](int, int, int, int) { desktop.SendMessage(desktop.HandleOf(form), 0xA1, 2, 0); };
  desktop.Show(form);

  PressMouse(WidgetOf(label), {10, 10});
  MoveMouse(WidgetOf(label), {10, 10}, Qt::LeftButton);
  ReleaseMouse(WidgetOf(label), {10, 10});

  EXPECT_EQ(clicks, 0);
}

TEST_F(Mouse, A_click_that_unloads_its_own_form_does_no_harm) {
  label.Click = [&] { desktop.Unload(form); };
  desktop.Show(form);

  Click(WidgetOf(label));
  QCoreApplication::processEvents();

  EXPECT_FALSE(form.IsLoaded());
}

} // namespace quendra::forms::qt
