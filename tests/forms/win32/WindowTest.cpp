#include "forms/win32/Win32Fixture.h"

#include <cstdlib>

namespace quendra::forms::win32 {

class Window : public Win32Fixture {
 protected:
  DWORD Style() const { return static_cast<DWORD>(::GetWindowLongW(WindowOf(form).Top(), GWL_STYLE)); }
  DWORD ExtendedStyle() const {
    return static_cast<DWORD>(::GetWindowLongW(WindowOf(form).Top(), GWL_EXSTYLE));
  }
  static Extent InsideOf(HWND window) {
    RECT inside{};
    ::GetClientRect(window, &inside);
    return {static_cast<int>(inside.right), static_cast<int>(inside.bottom)};
  }
};

TEST_F(Window, A_form_takes_its_size_in_twips) {
  desktop.Show(form);

  EXPECT_EQ(InsideOf(WindowOf(form).Top()), (Extent{400, 300}));
  EXPECT_EQ(InsideOf(WindowOf(form).Body()), (Extent{400, 300}));
}

TEST_F(Window, A_window_has_the_name_of_its_control_as_a_property) {
  Label label(form, u"lblOne(1)");

  desktop.Load(form);

  EXPECT_TRUE(::GetPropW(ViewOf(label).Window(), L"quendra:lblOne(1)"));
  EXPECT_TRUE(::GetPropW(WindowOf(form).Body(), L"quendra:frmTest"));
}

TEST_F(Window, A_form_comes_up_in_the_middle_of_the_screen_with_its_frame) {
  desktop.Show(form);

  const Area window = WindowOf(form).OnScreen();
  const Area screen = WindowOf(form).UsableScreen();
  EXPECT_LE(std::abs(window.corner.left + window.Right() - screen.corner.left - screen.Right()), 2);
  EXPECT_LE(std::abs(window.corner.top + window.Bottom() - screen.corner.top - screen.Bottom()), 2);
}

TEST_F(Window, A_form_over_an_owner_at_the_edge_of_the_screen_stays_on_the_screen) {
  TestForm other;
  other.Border = BorderStyle::None;
  desktop.Show(form);
  WindowOf(form).MoveToScreen({-300, -200});

  desktop.Show(other, Modality::Modeless, &form);

  EXPECT_EQ(WindowOf(other).OnScreen().corner, WindowOf(other).UsableScreen().corner);
}

TEST_F(Window, A_form_that_reads_from_right_to_left_has_a_mirrored_frame_and_a_body_that_is_not) {
  desktop.Load(form);

  EXPECT_TRUE(ExtendedStyle() & WS_EX_LAYOUTRTL);
  EXPECT_FALSE(::GetWindowLongW(WindowOf(form).Body(), GWL_EXSTYLE) & WS_EX_LAYOUTRTL);
}

TEST_F(Window, A_form_that_reads_from_left_to_right_is_not_mirrored) {
  form.RightToLeft = false;

  desktop.Load(form);

  EXPECT_FALSE(ExtendedStyle() & WS_EX_LAYOUTRTL);
}

TEST_F(Window, A_control_of_a_mirrored_form_keeps_its_distance_from_the_right_edge) {
  Label label(form, u"label");
  form.design = [&] { label.Move(10 * kPixel, 20 * kPixel, 100 * kPixel, 30 * kPixel); };

  desktop.Show(form);

  RECT place{};
  ::GetWindowRect(ViewOf(label).Window(), &place);
  ::MapWindowPoints(nullptr, WindowOf(form).Body(), reinterpret_cast<POINT*>(&place), 2);
  EXPECT_EQ(place.left, 400 - 110);
  EXPECT_EQ(place.right, 400 - 10);
  EXPECT_EQ(place.top, 20);
}

TEST_F(Window, A_fixed_single_border_has_a_minimise_box_and_no_maximise_box) {
  desktop.Load(form);

  EXPECT_EQ(Style() & WS_CAPTION, static_cast<DWORD>(WS_CAPTION));
  EXPECT_TRUE(Style() & WS_MINIMIZEBOX);
  EXPECT_FALSE(Style() & WS_MAXIMIZEBOX);
  EXPECT_FALSE(Style() & WS_THICKFRAME);
}

TEST_F(Window, A_form_without_a_border_has_no_frame) {
  form.Border = BorderStyle::None;

  desktop.Load(form);

  EXPECT_FALSE(Style() & WS_BORDER);
  EXPECT_EQ(WindowOf(form).Frame(), Extent());
}

TEST_F(Window, The_title_is_the_caption) {
  form.design = [&] { form.Caption = Text(u"זלמר בינלאומי@נט"); };

  desktop.Load(form);

  EXPECT_EQ(TextOf(WindowOf(form).Top()), u"זלמר בינלאומי@נט");
}

TEST_F(Window, The_text_of_a_window_is_the_accessible_name_of_its_control) {
  Label label(form, u"label");
  Label picture(form, u"picture");
  form.design = [&] { label.Caption = u"שלום"; };
  desktop.Load(form);
  picture.Description = u"set after the view came";

  desktop.Show(form);

  EXPECT_EQ(TextOf(ViewOf(label).Window()), u"שלום");
  EXPECT_EQ(TextOf(ViewOf(picture).Window()), u"set after the view came");
}

TEST_F(Window, What_stands_in_front_is_the_last_child_and_what_was_brought_there) {
  Label first(form, u"first");
  Label second(form, u"second");
  desktop.Load(form);
  EXPECT_EQ(::GetTopWindow(WindowOf(form).Body()), ViewOf(second).Window());

  first.BringToFront();

  EXPECT_EQ(::GetTopWindow(WindowOf(form).Body()), ViewOf(first).Window());
}

TEST_F(Window, A_round_region_cuts_the_corners_and_nothing_else) {
  form.Border = BorderStyle::None;
  desktop.Load(form);

  desktop.SetWindowRgn(desktop.HandleOf(form), desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10), false);

  const HRGN region = ::CreateRectRgn(0, 0, 0, 0);
  ::GetWindowRgn(WindowOf(form).Top(), region);
  EXPECT_FALSE(::PtInRegion(region, 0, 0));
  EXPECT_TRUE(::PtInRegion(region, 5, 1));
  EXPECT_TRUE(::PtInRegion(region, 0, 150));
  EXPECT_TRUE(::PtInRegion(region, 399, 150));
  EXPECT_TRUE(::PtInRegion(region, 200, 299));
  EXPECT_FALSE(::PtInRegion(region, 399, 299));
  ::DeleteObject(region);
}

TEST_F(Window, A_modal_form_keeps_the_user_from_the_others_and_gives_them_back) {
  TestForm other;
  desktop.Show(form);
  bool blocked = false;
  desktop.Post([&] {
    blocked = !::IsWindowEnabled(WindowOf(form).Top()) && ::IsWindowEnabled(WindowOf(other).Top());
    desktop.Unload(other);
  });

  desktop.Show(other, Modality::Modal, &form);

  EXPECT_TRUE(blocked);
  EXPECT_TRUE(::IsWindowEnabled(WindowOf(form).Top()));
}

TEST_F(Window, The_lower_of_two_modal_forms_goes_first_and_the_user_is_kept_from_the_others_on) {
  TestForm lower;
  TestForm upper;
  bool blocked = false;
  desktop.Show(form);
  desktop.Post([&] {
    desktop.Post([&] {
      desktop.Unload(lower);
      blocked = !::IsWindowEnabled(WindowOf(form).Top()) && ::IsWindowEnabled(WindowOf(upper).Top());
      desktop.Unload(upper);
    });
    desktop.Show(upper, Modality::Modal, &lower);
  });

  desktop.Show(lower, Modality::Modal, &form);

  EXPECT_TRUE(blocked);
  EXPECT_TRUE(::IsWindowEnabled(WindowOf(form).Top()));
}

TEST_F(Window, A_form_that_was_hidden_under_a_modal_one_takes_the_user_again_when_it_is_shown) {
  TestForm lower;
  TestForm upper;
  desktop.Show(form);
  desktop.Post([&] {
    desktop.Post([&] {
      lower.Visible = false;
      upper.Visible = false;
    });
    desktop.Show(upper, Modality::Modal, &lower);
  });
  desktop.Show(lower, Modality::Modal, &form);

  desktop.Show(lower);

  EXPECT_TRUE(::IsWindowEnabled(WindowOf(lower).Top()));
}

TEST_F(Window, A_form_that_was_minimised_gives_the_focus_back_to_the_control_that_had_it) {
  Label first(form, u"first");
  Label second(form, u"second");
  first.Click = second.Click = [] {};
  form.design = [&] {
    first.Move(0, 0, 1500, 450);
    second.Move(0, 600, 1500, 450);
  };
  ShowActive();
  user.PressKey(form, kTabKey);
  ASSERT_EQ(user.Focused(form), &second);

  ::ShowWindow(WindowOf(form).Top(), SW_MINIMIZE);
  desktop.PumpOnce();
  ::ShowWindow(WindowOf(form).Top(), SW_RESTORE);
  desktop.PumpOnce();

  EXPECT_EQ(::GetFocus(), ViewOf(second).Window());
}

TEST_F(Window, A_form_that_was_closed_by_its_own_click_goes_when_the_handler_has_ended) {
  TestForm other;
  Label label(form, u"label");
  form.design = [&] { label.Move(0, 0, 1500, 450); };
  HWND window = nullptr;
  bool stoodInHandler = false;
  label.Click = [&] {
    desktop.Unload(form);
    desktop.PumpOnce();
    stoodInHandler = ::IsWindow(window);
  };
  desktop.Show(other);
  desktop.Show(form);
  window = ViewOf(label).Window();

  user.Click(label);
  desktop.PumpOnce();

  EXPECT_TRUE(stoodInHandler);
  EXPECT_FALSE(::IsWindow(window));
}

// What is drawn.

TEST_F(Window, A_label_without_a_ground_shows_the_picture_box_below_it_when_that_changes) {
  PictureBox box(form, u"box");
  Label label(form, u"label");
  form.design = [&] {
    for (Control* control : std::vector<Control*>{&box, &label}) control->Move(0, 0, 1500, 1500);
    box.ScaleMode = ScaleMode::Pixels;
  };
  desktop.Show(form);
  desktop.Repaint(form);
  const COLORREF before = PixelOf(label, 50, 50);

  desktop.FillBox(box, 0, 0, 100, 100, kRed);
  desktop.Refresh(box);
  desktop.Repaint(form);

  EXPECT_NE(before, kRed);
  EXPECT_EQ(PixelOf(label, 50, 50), kRed);
}

TEST_F(Window, The_ground_of_a_form_is_its_colour) {
  Frame frame(form, u"frame");
  form.design = [&] { form.BackColour = Rgb(10, 200, 30); };
  desktop.Show(form);

  desktop.Repaint(form);

  EXPECT_EQ(PixelOf(form, 200, 200), Rgb(10, 200, 30));
}

// Screens with little room.

TEST_F(Window, A_form_that_is_wider_than_the_screen_is_shown_whole_and_smaller) {
  Label label(form, u"label");
  form.Border = BorderStyle::None;
  form.RightToLeft = false;
  const int screen = UsableScreenRound(nullptr).extent.width;
  form.design = [&] {
    form.Move(0, 0, screen * 5 / 4 * kPixel, 600 * kPixel);
    label.Move(100 * kPixel, 40 * kPixel, 200 * kPixel, 20 * kPixel);
  };

  desktop.Show(form);

  EXPECT_EQ(InsideOf(WindowOf(form).Top()), (Extent{screen, 480}));
  EXPECT_EQ(ViewOf(label).WindowPlace(), (Area{{80, 32}, {160, 16}}));
}

TEST_F(Window, A_form_that_is_twice_as_wide_as_the_screen_scrolls_at_70_percent_from_its_right_edge) {
  form.Border = BorderStyle::None;
  const int screen = UsableScreenRound(nullptr).extent.width;
  form.design = [&] { form.Move(0, 0, screen * 2 * kPixel, 300 * kPixel); };

  desktop.Show(form);

  EXPECT_TRUE(Style() & WS_HSCROLL);
  EXPECT_EQ(InsideOf(WindowOf(form).Body()).width, screen * 14 / 10);
  POINT right{screen * 14 / 10, 0};
  ::MapWindowPoints(WindowOf(form).Body(), nullptr, &right, 1);
  EXPECT_EQ(right.x, WindowOf(form).OnScreen().Right());
}

// Frames of another look.

TEST_F(Window, A_form_keeps_its_inside_when_the_frames_of_the_system_change) {
  NONCLIENTMETRICSW metrics{};
  metrics.cbSize = sizeof metrics;
  ::SystemParametersInfoW(SPI_GETNONCLIENTMETRICS, metrics.cbSize, &metrics, 0);
  const NONCLIENTMETRICSW before = metrics;
  desktop.Show(form);
  const HWND top = WindowOf(form).Top();
  // The system draws the new frames into windows of the old size, and tells of it.
  const auto change = [&](const NONCLIENTMETRICSW& wanted, UINT message, WPARAM what) {
    NONCLIENTMETRICSW set = wanted;
    ::SystemParametersInfoW(SPI_SETNONCLIENTMETRICS, set.cbSize, &set, 0);
    ::SetWindowPos(top, nullptr, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOZORDER | SWP_FRAMECHANGED);
    ::SendMessageW(top, message, what, 0);
    return InsideOf(top);
  };

  metrics.iCaptionHeight += 20;
  const Extent changed = change(metrics, WM_SETTINGCHANGE, SPI_SETNONCLIENTMETRICS);
  const Extent themed = change(before, WM_THEMECHANGED, 0);

  EXPECT_EQ(changed, (Extent{400, 300}));
  EXPECT_EQ(themed, (Extent{400, 300}));
}

TEST_F(Window, Tab_brings_what_it_finds_into_view) {
  Label near(form, u"near");
  Label far(form, u"far");
  form.Border = BorderStyle::None;
  const int screen = UsableScreenRound(nullptr).extent.width;
  form.design = [&] {
    form.Move(0, 0, screen * 2 * kPixel, 300 * kPixel);
    near.Move(0, 0, 1500, 450);
    far.Move((screen * 2 - 100) * kPixel, 0, 1500, 450);
    near.Click = far.Click = [] {};
  };
  ShowActive();

  user.PressKey(form, kTabKey);

  RECT place{};
  ::GetWindowRect(ViewOf(far).Window(), &place);
  EXPECT_EQ(user.Focused(form), &far);
  EXPECT_GE(place.left, 0);
  EXPECT_LE(place.right, screen);
}

} // namespace quendra::forms::win32
