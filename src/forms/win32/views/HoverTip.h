#pragma once

#include "forms/view/Area.h"
#include "runtime/Text.h"
#include "winapi/Winapi.h"

namespace quendra::forms::win32 {

/// The small window that shows a text whole where it is cut, while the mouse rests on it.
class HoverTip {
 public:
  HoverTip() = default;
  ~HoverTip();
  HoverTip(const HoverTip&) = delete;
  HoverTip& operator=(const HoverTip&) = delete;

  /// A message of the mouse to a window that has this tip, empty for none, where the mouse is.
  void Hear(HWND window, UINT message, const Text& tip);
  /// What is shown now; empty for nothing.
  const Text& Shown() const { return shown_; }
  void Hide();
  HWND Window() const { return window_; }

 private:
  void Show(HWND over, const Text& tip);

  HWND window_ = nullptr;
  Text shown_;
};

/// Where a message of the mouse tells that it is, from the left upper corner of a window's inside on the
/// screen, also in a mirrored one.
Spot PlainPlace(HWND window, LPARAM lParam);

} // namespace quendra::forms::win32
