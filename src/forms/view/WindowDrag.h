#pragma once

#include "forms/view/Area.h"

namespace quendra::forms {

/// A window that moves with the mouse from a press on it until the button is let go. Controls hear nothing of
/// the mouse meanwhile.
class WindowDrag {
 public:
  /// A window manager keeps the mouse to itself and moves the window.
  enum class By { Nobody, WindowManager, Desktop };
  enum class MouseEvent { Move, Press, Release };

  void Start(By mover, Spot mouse, Spot window) {
    mover_ = mover;
    grip_ = {mouse.left - window.left, mouse.top - window.top};
  }
  /// True for an event that belongs to the drag. Any that is no move with the left button held ends it; the
  /// release that does so belongs to it still.
  bool Takes(MouseEvent event, bool leftButtonHeld);
  /// Whether the desktop itself has the window follow the mouse.
  bool MovesWindow() const { return mover_ == By::Desktop; }
  /// Where the window lies with the mouse at a spot.
  Spot WindowAt(Spot mouse) const { return {mouse.left - grip_.left, mouse.top - grip_.top}; }

 private:
  By mover_ = By::Nobody;
  Spot grip_{};
};

} // namespace quendra::forms
