#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// Buttons as handlers get them, a sum of MouseButton.
constexpr int ButtonSum(bool left, bool right) {
  return (left ? kLeftButton : kNoButton) | (right ? kRightButton : kNoButton);
}

/// What presses, releases and moves of the mouse mean for the controls that they come to.
class MouseRules {
 public:
  enum class Meaning { Nothing, Press, Click, DoubleClick };

  /// `button` is the one that went down. The left one makes the control the pressed one.
  Meaning Pressed(const Control& control, int button);
  /// The second press of two in quick succession. Without a handler for double clicks it is a press like the
  /// first.
  Meaning PressedAgain(const Control& control, int button);
  /// A click is a press and a release of the left button on one control. Any other release of it ends the
  /// press too.
  Meaning Released(const Control& control, int button, bool inside);

  /// The pressed control gets no click any more.
  void ReleaseCapture() { pressed_ = nullptr; }
  void Forget(const Control& control);

 private:
  const Control* pressed_ = nullptr;
};

/// The cursor that handlers set while the mouse moves over their control. It stays until the mouse moves over
/// a control whose handler sets none.
class CursorRules {
 public:
  void MoveBegins() { wasSet_ = false; }
  void Set() { wasSet_ = true; }
  /// Whether the control that the mouse moved over goes back to the usual cursor.
  bool MoveEndsIt() const { return !wasSet_; }

 private:
  bool wasSet_ = false;
};

} // namespace quendra::forms
