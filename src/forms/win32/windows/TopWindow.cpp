#include "forms/win32/windows/TopWindow.h"

#include "forms/win32/windows/WindowClass.h"

#include "runtime/Fault.h"

namespace quendra::forms::win32 {

namespace {

Area AreaOf(const RECT& rectangle) {
  return {{static_cast<int>(rectangle.left), static_cast<int>(rectangle.top)},
          {static_cast<int>(rectangle.right - rectangle.left),
           static_cast<int>(rectangle.bottom - rectangle.top)}};
}

} // namespace

Area UsableScreenRound(HWND window) {
  MONITORINFO screen{};
  screen.cbSize = sizeof screen;
  ::GetMonitorInfoW(::MonitorFromWindow(window, MONITOR_DEFAULTTOPRIMARY), &screen);
  return AreaOf(screen.rcWork);
}

TopWindow::TopWindow(DWORD style, DWORD extendedStyle)
    : top_(::CreateWindowExW(extendedStyle, OwnClass(L"QuendraForm", Procedure), L"", style | WS_CLIPCHILDREN,
                             0, 0, 0, 0, nullptr, nullptr, ThisProgram(), nullptr)) {
  if (!top_) throw Fault(Fault::kOutOfMemory);
  ::SetWindowLongPtrW(top_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
}

TopWindow::~TopWindow() {
  Silence();
  ::DestroyWindow(top_);
}

Area TopWindow::OnScreen() const {
  RECT place{};
  ::GetWindowRect(top_, &place);
  return AreaOf(place);
}

Area TopWindow::UsableScreen() const { return UsableScreenRound(top_); }

Extent TopWindow::Frame() const {
  RECT frame{};
  // Scroll bars are a part of the inside.
  const auto style = static_cast<DWORD>(::GetWindowLongW(top_, GWL_STYLE)) & ~(WS_HSCROLL | WS_VSCROLL);
  ::AdjustWindowRectEx(&frame, style, FALSE, static_cast<DWORD>(::GetWindowLongW(top_, GWL_EXSTYLE)));
  return AreaOf(frame).extent;
}

LRESULT CALLBACK TopWindow::Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
  auto* const top = reinterpret_cast<TopWindow*>(::GetWindowLongPtrW(window, GWLP_USERDATA));
  if (!top) return ::DefWindowProcW(window, message, wParam, lParam);
  try {
    if (const auto answer = top->AnswerTop(message, wParam, lParam)) return *answer;
  } catch (...) {
    top->ReportThrown();
    return 0;
  }
  return ::DefWindowProcW(window, message, wParam, lParam);
}

} // namespace quendra::forms::win32
