#include "platform/windows/remote_access/DialRelay.h"

#include "platform/remote_access/RemoteAccessNumbers.h"

namespace quendra::platform::windows {

namespace {

constexpr const wchar_t* kClassName = L"QuendraDialRelay";

UINT MessageOfDials() {
  const UINT registered = ::RegisterWindowMessageA(kRasDialEventName);
  return registered != 0 ? registered : UINT{kRasDialEvent};
}

} // namespace

DialRelay::DialRelay(Hear hear) : hear_(std::move(hear)), told_(MessageOfDials()) {
  WNDCLASSEXW description{};
  description.cbSize = sizeof description;
  description.lpfnWndProc = &DialRelay::Receive;
  description.hInstance = ::GetModuleHandleW(nullptr);
  description.lpszClassName = kClassName;
  ::RegisterClassExW(&description); // again is refused, and does no harm
  window_ = ::CreateWindowExW(0, kClassName, nullptr, 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr,
                              description.hInstance, nullptr);
  if (window_) ::SetWindowLongW(window_, GWL_USERDATA, reinterpret_cast<LONG>(this));
}

DialRelay::~DialRelay() {
  if (window_) ::DestroyWindow(window_);
}

LRESULT CALLBACK DialRelay::Receive(HWND window, UINT message, WPARAM state, LPARAM error) {
  auto* const relay = reinterpret_cast<DialRelay*>(::GetWindowLongW(window, GWL_USERDATA));
  if (relay && relay->Pass(message, state, error)) return TRUE;
  return ::DefWindowProcW(window, message, state, error);
}

bool DialRelay::Pass(UINT message, WPARAM state, LPARAM error) noexcept {
  if (message != told_) return false;
  try {
    hear_(static_cast<std::uint32_t>(state), static_cast<std::uint32_t>(error));
  } catch (...) {
    // Without memory to pass it on this change stays untold; nothing may unwind into the system.
  }
  return true;
}

} // namespace quendra::platform::windows
