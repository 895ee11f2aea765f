#include "forms/win32/Win32Fixture.h"

namespace quendra::forms::win32 {

class Mouse : public Win32Fixture {
 protected:
  Mouse() {
    form.design = [this] { label.Move(1500, 1500, 1500, 750); };
  }
  Label label{form, u"label"};
};

TEST_F(Mouse, A_release_outside_the_label_is_no_click) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  desktop.Show(form);

  SendMouse(label, WM_LBUTTONDOWN, {5, 5}, MK_LBUTTON);
  SendMouse(label, WM_LBUTTONUP, {500, 5});
  EXPECT_EQ(clicks, 0);
  user.Click(label);

  EXPECT_EQ(clicks, 1);
}

TEST_F(Mouse, The_right_button_presses_but_does_not_click) {
  std::string events;
  label.MouseDown = [&](int button, int, int, int) { events += std::to_string(button); };
  label.Click = [&] { events += 'c'; };
  desktop.Show(form);

  SendMouse(label, WM_RBUTTONDOWN, {5, 5}, MK_RBUTTON);
  SendMouse(label, WM_RBUTTONUP, {5, 5});

  EXPECT_EQ(events, "2");
}

TEST_F(Mouse, A_double_click_raises_its_event_behind_one_click) {
  std::string events;
  label.Click = [&] { events += 'c'; };
  label.DoubleClick = [&] { events += 'd'; };
  desktop.Show(form);

  user.Click(label);
  SendMouse(label, WM_LBUTTONDBLCLK, {5, 5}, MK_LBUTTON);
  SendMouse(label, WM_LBUTTONUP, {5, 5});

  EXPECT_EQ(events, "cd");
}

TEST_F(Mouse, Moves_come_with_the_held_button_and_the_place_in_twips_from_the_leading_edge) {
  std::vector<int> moved;
  label.MouseMove = [&](int button, int shift, int left, int top) { moved = {button, shift, left, top}; };
  desktop.Show(form);

  MoveMouse(label, {90, 20}, MK_LBUTTON | MK_CONTROL);

  EXPECT_EQ(moved, (std::vector<int>{kLeftButton, kCtrl, 10 * kPixel, 20 * kPixel}));
}

TEST_F(Mouse, A_disabled_label_hears_nothing_and_neither_does_what_lies_below) {
  int events = 0;
  PictureBox box(form, u"box");
  Label on(box, u"on");
  form.design = [&] {
    box.Move(0, 0, 3000, 3000);
    on.Move(0, 0, 3000, 3000);
  };
  box.MouseMove = on.MouseMove = [&](int, int, int, int) { ++events; };
  desktop.Show(form);
  on.Enabled = false;

  // The system gives what happens over a disabled window to its container.
  MoveMouse(box, {5, 5});
  MoveMouse(on, {5, 5});

  EXPECT_EQ(events, 0);
}

TEST_F(Mouse, The_hand_cursor_stays_until_the_mouse_moves_over_a_control_that_sets_none) {
  Label other(form, u"other");
  bool setsCursor = true;
  const CursorHandle hand = desktop.LoadCursor(32649);
  label.MouseMove = [&](int, int, int, int) {
    if (setsCursor) desktop.SetCursor(hand);
  };
  desktop.Show(form);

  MoveMouse(label, {5, 5});
  EXPECT_NE(ViewOf(label).cursor, nullptr);
  MoveMouse(other, {5, 5});
  EXPECT_EQ(ViewOf(other).cursor, nullptr);
  EXPECT_NE(ViewOf(label).cursor, nullptr);
  setsCursor = false;
  MoveMouse(label, {5, 6});

  EXPECT_EQ(ViewOf(label).cursor, nullptr);
}

TEST_F(Mouse, Only_system_cursors_have_handles) {
  EXPECT_NE(desktop.LoadCursor(32649), kNoCursor);
  EXPECT_EQ(desktop.LoadCursor(1), kNoCursor);
}

TEST_F(Mouse, A_caption_press_drags_the_window_and_the_release_is_no_click) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  label.MouseMove = [&](int button, int, int, int) {
    if (button != kLeftButton) return;
    desktop.ReleaseCapture();
    desktop.SendMessage(desktop.HandleOf(form), 0xA1, 2, 0);
  };
  desktop.Show(form);
  const Spot before = WindowOf(form).OnScreen().corner;

  ::SetCursorPos(300, 300);
  SendMouse(label, WM_LBUTTONDOWN, {10, 10}, MK_LBUTTON);
  MoveMouse(label, {10, 10}, MK_LBUTTON);
  ::SetCursorPos(320, 315);
  MoveMouse(form, {30, 25}, MK_LBUTTON);
  const Spot dragged = WindowOf(form).OnScreen().corner;
  SendMouse(form, WM_LBUTTONUP, {30, 25});
  ::SetCursorPos(400, 400);
  MoveMouse(form, {50, 25});

  EXPECT_EQ(dragged, (Spot{before.left + 20, before.top + 15}));
  EXPECT_EQ(WindowOf(form).OnScreen().corner, dragged);
  EXPECT_EQ(clicks, 0);
}

TEST_F(Mouse, Nothing_is_under_the_mouse_in_a_form_that_the_user_is_kept_from) {
  desktop.Show(form);
  MoveMouse(label, {5, 5});
  ASSERT_TRUE(ViewOf(label).IsUnderMouse());

  ::EnableWindow(WindowOf(form).Top(), FALSE);
  EXPECT_FALSE(ViewOf(label).IsUnderMouse());
  ::EnableWindow(WindowOf(form).Top(), TRUE);
  MoveMouse(label, {6, 5});

  EXPECT_TRUE(ViewOf(label).IsUnderMouse());
}

TEST_F(Mouse, A_press_hides_the_ring_of_those_who_use_the_keys) {
  Label button(form, u"button");
  button.Click = [] {};
  ShowActive();
  user.PressKey(form, kTabKey);
  EXPECT_TRUE(ViewOf(button).UsesKeys());

  SendMouse(label, WM_LBUTTONDOWN, {5, 5}, MK_LBUTTON);
  SendMouse(label, WM_LBUTTONUP, {5, 5});

  EXPECT_FALSE(ViewOf(button).UsesKeys());
}

} // namespace quendra::forms::win32
