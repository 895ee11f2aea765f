#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>

namespace quendra::forms {

using RegionHandle = OpaqueHandle<struct RegionKind>;
using CursorHandle = OpaqueHandle<struct CursorKind>;
inline constexpr CursorHandle kNoCursor;

/// Mouse pointer, shape and messages of windows.
class WindowOperations {
 public:
  virtual ~WindowOperations() = default;

  /// Handle of a system cursor, kNoCursor when there is none. 32649 is the hand.
  virtual CursorHandle LoadCursor(int id) = 0;
  virtual void SetCursor(CursorHandle cursor) = 0;
  virtual void ReleaseCapture() = 0;
  virtual std::int32_t SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                   std::uint32_t lParam) = 0;
  virtual double TwipsPerPixelX() const = 0;
  virtual double TwipsPerPixelY() const = 0;
  /// Pixels: left, top, right, bottom, width and height of the corner ellipses.
  virtual RegionHandle CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                          int ellipseHeight) = 0;
  virtual void SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) = 0;
};

} // namespace quendra::forms
