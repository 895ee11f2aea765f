#include "forms/win32/views/InnerWindow.h"

#include "forms/win32/input/MouseInput.h"

#include <algorithm>
#include <utility>

namespace quendra::forms::win32 {

InnerWindow::InnerWindow(WindowView& view, const Kind& kind, Hearer hear)
    : view_(view),
      window_(::CreateWindowExW(
          kind.extendedStyle, kind.windowClass, L"", kind.style | WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS, 0,
          0, 0, 0, kind.parent ? kind.parent : view.Window(), nullptr, ::GetModuleHandleW(nullptr), nullptr)),
      hear_(std::move(hear)) {
  Join();
}

InnerWindow::InnerWindow(WindowView& view, HWND window, Hearer hear)
    : view_(view), window_(window), hear_(std::move(hear)) {
  Join();
}

void InnerWindow::Join() {
  if (!window_) return;
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
  before_ = reinterpret_cast<WNDPROC>(
      ::SetWindowLongPtrW(window_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(Procedure)));
}

// The window may outlive this for a moment: that of the view is destroyed last.
InnerWindow::~InnerWindow() {
  if (!window_) return;
  ::SetWindowLongPtrW(window_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(before_));
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, 0);
}

// The new one has its place before it gets the focus: what comes with that is asked of the one in its place.
void InnerWindow::Replace(std::unique_ptr<InnerWindow>& standing, std::unique_ptr<InnerWindow> made) {
  const HWND before = standing ? standing->Window() : nullptr;
  const bool hadFocus = standing && standing->HasFocus();
  standing = std::move(made);
  if (hadFocus) ::SetFocus(standing->Window());
  if (before) ::DestroyWindow(before);
}

LRESULT InnerWindow::PassOn(UINT message, WPARAM wParam, LPARAM lParam) const {
  return before_ ? ::CallWindowProcW(before_, window_, message, wParam, lParam) : 0;
}

void InnerWindow::MoveTo(const Area& place) const {
  ::SetWindowPos(window_, nullptr, place.corner.left, place.corner.top, place.extent.width,
                 place.extent.height, SWP_NOZORDER | SWP_NOACTIVATE);
}

Extent InnerWindow::Inside() const {
  RECT inside{};
  ::GetClientRect(window_, &inside);
  return {static_cast<int>(inside.right), static_cast<int>(inside.bottom)};
}

bool InnerWindow::SetStyle(int index, DWORD bits, bool on) const {
  const DWORD before = Style(index);
  const DWORD wanted = on ? before | bits : before & ~bits;
  if (wanted != before) ::SetWindowLongW(window_, index, static_cast<LONG>(wanted));
  return wanted != before;
}

bool InnerWindow::IsTaken(UINT message, WPARAM wParam, LPARAM lParam) const {
  if (message < WM_MOUSEFIRST || message > WM_RBUTTONDBLCLK) return false;
  POINT place{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))};
  ::MapWindowPoints(window_, view_.Window(), &place, 1);
  return view_.Context().mouse.Takes(view_, message, wParam, MAKELPARAM(place.x, place.y));
}

LRESULT InnerWindow::Handle(UINT message, WPARAM wParam, LPARAM lParam) {
  const WindowView::Work work(view_);
  // The window lets go of the mouse before the control is clicked: the handler may show another one.
  if (message == WM_LBUTTONUP && ::GetCapture() == window_) {
    const LRESULT answer = Answer(message, wParam, lParam);
    IsTaken(message, wParam, lParam);
    return answer;
  }
  const bool taken = IsTaken(message, wParam, lParam);
  view_.HearForTip(window_, message, lParam);
  return taken ? 0 : Answer(message, wParam, lParam);
}

LRESULT InnerWindow::Answer(UINT message, WPARAM wParam, LPARAM lParam) {
  if (const auto answer = hear_(message, wParam, lParam)) return *answer;
  return PassOn(message, wParam, lParam);
}

LRESULT CALLBACK InnerWindow::Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
  auto* inner = reinterpret_cast<InnerWindow*>(::GetWindowLongPtrW(window, GWLP_USERDATA));
  if (!inner) return ::DefWindowProcW(window, message, wParam, lParam);
  if (message == WM_NCDESTROY) {
    const LRESULT answer = inner->PassOn(message, wParam, lParam);
    inner->window_ = nullptr;
    return answer;
  }
  try {
    return inner->Handle(message, wParam, lParam);
  } catch (...) {
    // No fault may go through the system's code that called.
    inner->view_.Context().dispatcher.Dispatch([] { throw; });
    return 0;
  }
}

Text TextOfWindow(HWND window) {
  Text text(static_cast<std::size_t>(std::max(0, ::GetWindowTextLengthW(window))) + 1, u'\0');
  const int length =
      ::GetWindowTextW(window, reinterpret_cast<wchar_t*>(text.data()), static_cast<int>(text.size()));
  text.resize(static_cast<std::size_t>(std::max(0, length)));
  return text;
}

} // namespace quendra::forms::win32
