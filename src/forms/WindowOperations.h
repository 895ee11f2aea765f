#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <string>

namespace quendra::forms {

using RegionHandle = OpaqueHandle<struct RegionKind>;
using CursorHandle = OpaqueHandle<struct CursorKind>;
inline constexpr CursorHandle kNoCursor;

/// Where a window comes to stand, and parts of SetWindowPos that are left out, as the platform numbers them.
enum class InsertAfter : int { NotTopmost = -2, Topmost = -1, Top = 0, Bottom = 1 };
enum PositionFlags : unsigned { kKeepsSize = 1, kKeepsPlace = 2, kKeepsOrder = 4 };

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
  /// The number of the window messages of that name, the same for whoever asks; 0 on failure.
  virtual std::uint32_t RegisterWindowMessageA(const std::string& name) = 0;
  virtual double TwipsPerPixelX() const = 0;
  virtual double TwipsPerPixelY() const = 0;
  /// Pixels: left, top, right, bottom, width and height of the corner ellipses.
  virtual RegionHandle CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                          int ellipseHeight) = 0;
  virtual void SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) = 0;
  /// Puts a window in front of others or behind them, at a place of the screen in pixels, or only one of
  /// both. False for a handle that is no form's, and for a new size: a form's size is its own.
  virtual bool SetWindowPos(WindowHandle window, InsertAfter insertAfter, int x, int y, int cx, int cy,
                            unsigned flags) = 0;
};

} // namespace quendra::forms
