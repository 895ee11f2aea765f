#pragma once

#include "forms/view/Keyboard.h"
#include "forms/win32/input/LayoutCharacters.h"

namespace quendra::forms::win32 {

class FormWindow;
class WindowView;

/// Gives keys to forms before the control that has the focus, moves the focus by Tab, and presses the form's
/// Default and Cancel controls by keys that no control took.
class KeyInput {
 public:
  /// A key as the system tells it with WM_KEYDOWN or WM_SYSKEYDOWN. Its code is that of the character that it
  /// gives without modifiers in the active layout, upper case for Latin letters; for Enter, Escape and the
  /// like the system's own, and 0 for a key that has neither.
  KeyPress PressOf(WPARAM wParam, LPARAM lParam);
  /// A message that comes out of the queue. True for one that no window gets any more.
  bool Takes(const MSG& message);

 private:
  static bool Handle(FormWindow& form, WindowView& view, const KeyPress& key);
  static bool MoveFocus(FormWindow& form, const KeyPress& key);

  LayoutCharacters characters_;
};

} // namespace quendra::forms::win32
