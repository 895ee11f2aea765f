#include "forms/win32/views/HoverTip.h"

#include "forms/view/VisibleText.h"
#include "forms/win32/windows/TopWindow.h"

#include <algorithm>
#include <commctrl.h>

namespace quendra::forms::win32 {

namespace {

constexpr int kBelowMouse = 20;
constexpr int kAboveMouse = 4;
constexpr LPARAM kWidest = 600;

/// The record of the one tool that a tip window has; the length is that of all systems.
TTTOOLINFOW ToolOf(HWND tip, const Text& text) {
  TTTOOLINFOW tool{};
  tool.cbSize = TTTOOLINFOW_V2_SIZE;
  tool.uFlags = TTF_TRACK | TTF_ABSOLUTE | TTF_TRANSPARENT;
  if (DirectionOf(text) == Direction::RightToLeft) tool.uFlags |= TTF_RTLREADING;
  tool.hwnd = ::GetWindow(tip, GW_OWNER);
  tool.lpszText = const_cast<wchar_t*>(winapi::Wide(text));
  return tool;
}

void Send(HWND tip, UINT message, WPARAM wParam, const TTTOOLINFOW& tool) {
  ::SendMessageW(tip, message, wParam, reinterpret_cast<LPARAM>(&tool));
}

/// Below the mouse, above it where the screen ends, and nowhere off the screen: a tip that follows the mouse
/// is shown where it is told.
Spot PlaceOf(const Area& screen, Extent tip, Spot mouse) {
  const int below = mouse.top + kBelowMouse;
  const bool fits = below + tip.height <= screen.Bottom();
  return {std::max(screen.corner.left, std::min(mouse.left, screen.Right() - tip.width)),
          fits ? below : mouse.top - kAboveMouse - tip.height};
}

} // namespace

// It goes with its owner.
HoverTip::~HoverTip() {
  if (window_ && ::IsWindow(window_)) ::DestroyWindow(window_);
}

void HoverTip::Hear(HWND window, UINT message, const Text& tip) {
  if (message == WM_MOUSEHOVER && !tip.empty()) return Show(window, tip);
  if (message != WM_MOUSEMOVE || tip != shown_) Hide();
  if (message != WM_MOUSEMOVE || tip.empty() || tip == shown_) return;
  TRACKMOUSEEVENT rest{sizeof rest, TME_HOVER | TME_LEAVE, window, HOVER_DEFAULT};
  ::TrackMouseEvent(&rest);
}

void HoverTip::Show(HWND over, const Text& tip) {
  if (!window_ || !::IsWindow(window_))
    window_ =
        ::CreateWindowExW(WS_EX_TOPMOST, TOOLTIPS_CLASSW, L"", WS_POPUP | TTS_ALWAYSTIP | TTS_NOPREFIX, 0, 0,
                          0, 0, ::GetAncestor(over, GA_ROOT), nullptr, ::GetModuleHandleW(nullptr), nullptr);
  if (!window_) return;
  Hide();
  const TTTOOLINFOW tool = ToolOf(window_, tip);
  Send(window_, TTM_ADDTOOLW, 0, tool);
  // Without a widest length a line break is no break.
  ::SendMessageW(window_, TTM_SETMAXTIPWIDTH, 0, kWidest);
  POINT mouse{};
  ::GetCursorPos(&mouse);
  const LRESULT size = ::SendMessageW(window_, TTM_GETBUBBLESIZE, 0, reinterpret_cast<LPARAM>(&tool));
  const Spot place = PlaceOf(UsableScreenRound(over), {LOWORD(size), HIWORD(size)},
                             {static_cast<int>(mouse.x), static_cast<int>(mouse.y)});
  ::SendMessageW(window_, TTM_TRACKPOSITION, 0, MAKELPARAM(place.left, place.top));
  Send(window_, TTM_TRACKACTIVATE, TRUE, tool);
  shown_ = tip;
}

void HoverTip::Hide() {
  if (shown_.empty()) return;
  const TTTOOLINFOW tool = ToolOf(window_, shown_);
  Send(window_, TTM_TRACKACTIVATE, FALSE, tool);
  Send(window_, TTM_DELTOOLW, 0, tool);
  shown_.clear();
}

Spot PlainPlace(HWND window, LPARAM lParam) {
  POINT place{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))};
  ::ClientToScreen(window, &place);
  RECT inside{};
  ::GetClientRect(window, &inside);
  ::MapWindowPoints(window, nullptr, reinterpret_cast<POINT*>(&inside), 2);
  return {static_cast<int>(place.x - inside.left), static_cast<int>(place.y - inside.top)};
}

} // namespace quendra::forms::win32
