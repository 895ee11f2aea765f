#pragma once

#include "winapi/Winapi.h"

#include <functional>

namespace quendra::platform::windows {

/// A window that nobody sees, to which libraries of the system send their messages. It belongs to the thread
/// that makes it and hears them whenever that thread's messages are dispatched.
class RelayWindow {
 public:
  using Handler = std::function<void(UINT message, WPARAM wParam, LPARAM lParam)>;

  /// The handler gets the messages from here on, up to kLastMessage; others aren't for it.
  static constexpr UINT kFirstMessage = WM_APP;
  static constexpr UINT kLastMessage = 0xBFFF;

  explicit RelayWindow(Handler handler);
  ~RelayWindow();
  RelayWindow(const RelayWindow&) = delete;
  RelayWindow& operator=(const RelayWindow&) = delete;

  /// nullptr where the system gave none.
  HWND Get() const { return window_; }

 private:
  static LRESULT CALLBACK Receive(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;

  const Handler handler_;
  HWND window_;
};

} // namespace quendra::platform::windows
