#include "platform/windows/net/RelayWindow.h"

namespace quendra::platform::windows {

namespace {

constexpr const wchar_t* kClassName = L"QuendraRelay";

} // namespace

RelayWindow::RelayWindow(Handler handler) : handler_(std::move(handler)) {
  const HINSTANCE program = ::GetModuleHandleW(nullptr);
  WNDCLASSEXW kind{};
  kind.cbSize = sizeof kind;
  kind.lpfnWndProc = &RelayWindow::Receive;
  kind.hInstance = program;
  kind.lpszClassName = kClassName;
  ::RegisterClassExW(&kind); // fails for the second relay, whose class is there already
  window_ = ::CreateWindowExW(0, kClassName, L"", 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr, program, nullptr);
  if (window_) ::SetWindowLongPtrW(window_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
}

RelayWindow::~RelayWindow() {
  if (!window_) return;
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, 0);
  ::DestroyWindow(window_);
}

LRESULT CALLBACK RelayWindow::Receive(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
  const auto* relay = reinterpret_cast<const RelayWindow*>(::GetWindowLongPtrW(window, GWLP_USERDATA));
  if (!relay || message < kFirstMessage || message > kLastMessage)
    return ::DefWindowProcW(window, message, wParam, lParam);
  try {
    relay->handler_(message, wParam, lParam);
  } catch (...) {
    // No fault can cross the system's frames below. A handler here only posts; without memory for that the
    // message is lost.
  }
  return 0;
}

} // namespace quendra::platform::windows
