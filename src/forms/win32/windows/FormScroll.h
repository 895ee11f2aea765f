#pragma once

#include "forms/view/Area.h"
#include "winapi/Winapi.h"

namespace quendra::forms::win32 {

/// Shows a part of a form that is larger than its window: scroll bars at the window, which may be mirrored,
/// and the place of the body in it.
class FormScroll {
 public:
  FormScroll(HWND window) : window_(window) {}

  /// Lays the body, of this size, in the window. `scrolls`: with bars beside what doesn't fit.
  void Lay(HWND body, Extent size, bool scrolls);
  /// A message of the window; false for one that is none of a scroll bar or wheel.
  bool Takes(UINT message, WPARAM wParam);
  /// By the shortest way; in the body's pixels.
  void BringIntoView(Area area);

 private:
  void Measure(int bar, int whole, int shown) const;
  int PositionOf(int bar) const;
  bool ScrollTo(int bar, int position);
  void PutBody();

  HWND window_;
  HWND body_ = nullptr;
  Extent size_{};
  bool scrolls_ = false;
};

} // namespace quendra::forms::win32
