#pragma once

#include "forms/win32/Win32Driver.h"
#include "forms/win32/views/FieldView.h"

#include <gtest/gtest.h>

#include <vector>

namespace quendra::forms::win32 {

/// A form of 400 by 300 pixels that is laid out by the test.
struct TestForm : Form {
  TestForm() : Form(u"frmTest") {}
  void Design() override {
    Move(0, 0, 6000, 4500);
    if (design) design();
  }
  std::function<void()> design;
};

/// Controls as they stand on the screen of the bed.
class ViewFixture : public testing::Test {
 protected:
  template <typename Kind> static Kind& As(const Control& control) {
    return dynamic_cast<Kind&>(*control.View());
  }
  /// The system's window in a field.
  static HWND Inner(const Control& control) { return As<FieldView>(control).Inner().Window(); }

  void Show();
  void Key(int code, int shift = kNoShift) { user.PressKey(form, code, shift); }
  void Press(HWND window, Spot place, UINT message = WM_LBUTTONDOWN, WPARAM keys = MK_LBUTTON);
  void Click(HWND window, Spot place);
  /// Lets the loop do what is waiting.
  void Settle();
  /// A pixel of a window as it is drawn now, from its left upper corner on the screen.
  static Colour PixelOf(HWND window, int x, int y);

  Win32Driver user;
  Desktop& desktop = user.TheDesktop();
  TestForm form;
};

} // namespace quendra::forms::win32
