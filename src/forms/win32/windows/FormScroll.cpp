#include "forms/win32/windows/FormScroll.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

constexpr int kStep = 24;

Extent InsideOf(HWND window) {
  RECT inside{};
  ::GetClientRect(window, &inside);
  return {static_cast<int>(inside.right), static_cast<int>(inside.bottom)};
}

SCROLLINFO StateOf(HWND window, int bar) {
  SCROLLINFO state{};
  state.cbSize = sizeof state;
  state.fMask = SIF_ALL;
  ::GetScrollInfo(window, bar, &state);
  return state;
}

/// Where a request of a scroll bar leads.
int Reached(const SCROLLINFO& state, int request) {
  const int page = static_cast<int>(state.nPage);
  switch (request) {
  case SB_LINEUP: return state.nPos - kStep;
  case SB_LINEDOWN: return state.nPos + kStep;
  case SB_PAGEUP: return state.nPos - page;
  case SB_PAGEDOWN: return state.nPos + page;
  case SB_THUMBPOSITION:
  case SB_THUMBTRACK: return state.nTrackPos;
  case SB_TOP: return 0;
  case SB_BOTTOM: return state.nMax;
  default: return state.nPos;
  }
}

/// The smallest change of a position that shows what lies between two ends.
int Showing(int position, int shown, int begin, int end) {
  return std::min(std::max(position, end - shown), begin);
}

} // namespace

void FormScroll::Lay(HWND body, Extent size, bool scrolls) {
  body_ = body;
  size_ = size;
  scrolls_ = scrolls;
  // A bar that comes or goes changes the room for the other.
  for (int pass = 0; pass < 2; ++pass) {
    Measure(SB_HORZ, size.width, InsideOf(window_).width);
    Measure(SB_VERT, size.height, InsideOf(window_).height);
  }
  PutBody();
}

void FormScroll::Measure(int bar, int whole, int shown) const {
  SCROLLINFO state{};
  state.cbSize = sizeof state;
  state.fMask = SIF_RANGE | SIF_PAGE;
  state.nMax = scrolls_ && whole > shown ? whole - 1 : 0;
  state.nPage = static_cast<UINT>(std::max(scrolls_ ? shown : 1, 1));
  ::SetScrollInfo(window_, bar, &state, TRUE);
}

int FormScroll::PositionOf(int bar) const { return scrolls_ ? StateOf(window_, bar).nPos : 0; }

bool FormScroll::ScrollTo(int bar, int position) {
  SCROLLINFO state{};
  state.cbSize = sizeof state;
  state.fMask = SIF_POS;
  state.nPos = std::max(position, 0);
  ::SetScrollInfo(window_, bar, &state, TRUE);
  PutBody();
  return true;
}

// In a mirrored window places count from its right edge, and so does its bar.
void FormScroll::PutBody() {
  ::SetWindowPos(body_, nullptr, -PositionOf(SB_HORZ), -PositionOf(SB_VERT), size_.width, size_.height,
                 SWP_NOZORDER | SWP_NOACTIVATE);
}

bool FormScroll::Takes(UINT message, WPARAM wParam) {
  if (!scrolls_ || !body_) return false;
  if (message == WM_HSCROLL || message == WM_VSCROLL) {
    const int bar = message == WM_HSCROLL ? SB_HORZ : SB_VERT;
    return ScrollTo(bar, Reached(StateOf(window_, bar), LOWORD(wParam)));
  }
  if (message != WM_MOUSEWHEEL) return false;
  constexpr int kSteps = 3;
  const int turned = static_cast<short>(HIWORD(wParam));
  return ScrollTo(SB_VERT, PositionOf(SB_VERT) - turned * kSteps * kStep / WHEEL_DELTA);
}

void FormScroll::BringIntoView(Area area) {
  if (!scrolls_ || !body_) return;
  const Extent inside = InsideOf(window_);
  // From the edge where the window's own places begin.
  const bool mirrored = ::GetWindowLongW(window_, GWL_EXSTYLE) & WS_EX_LAYOUTRTL;
  const int begin = mirrored ? size_.width - area.Right() : area.corner.left;
  ScrollTo(SB_HORZ, Showing(PositionOf(SB_HORZ), inside.width, begin, begin + area.extent.width));
  ScrollTo(SB_VERT, Showing(PositionOf(SB_VERT), inside.height, area.corner.top, area.Bottom()));
}

} // namespace quendra::forms::win32
