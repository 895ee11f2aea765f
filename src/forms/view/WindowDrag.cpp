#include "forms/view/WindowDrag.h"

namespace quendra::forms {

bool WindowDrag::Takes(MouseEvent event, bool leftButtonHeld) {
  if (mover_ == By::Nobody) return false;
  // Moves from before a window manager took over are still on their way. Were the window's move asked for
  // again by one of them, the manager would go on moving after the release.
  if (event == MouseEvent::Move && leftButtonHeld) return true;
  mover_ = By::Nobody;
  return event == MouseEvent::Release;
}

} // namespace quendra::forms
