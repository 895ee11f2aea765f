#pragma once

#include "forms/win32/Win32Fixture.h"
#include "forms/win32/views/FieldView.h"

namespace quendra::forms::win32 {

/// Controls as they stand on the screen of the bed.
class ViewFixture : public Win32Fixture {
 protected:
  template <typename Kind> static Kind& As(const Control& control) {
    return dynamic_cast<Kind&>(*control.View());
  }
  /// The system's window in a field.
  static HWND Inner(const Control& control) { return As<FieldView>(control).Inner().Window(); }

  /// Shows the form in front, with the focus in its first control.
  void Show();
  void Key(int code, int shift = kNoShift) { user.PressKey(form, code, shift); }
  void Press(HWND window, Spot place, UINT message = WM_LBUTTONDOWN, WPARAM keys = MK_LBUTTON);
  void Click(HWND window, Spot place);
  /// Lets the loop do what is waiting.
  void Settle();
  /// A pixel of a window as it is drawn now, from its left upper corner on the screen.
  static Colour PixelIn(HWND window, int x, int y);
};

} // namespace quendra::forms::win32
