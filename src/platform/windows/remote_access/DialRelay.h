#pragma once

#include "winapi/Winapi.h"

#include <cstdint>
#include <functional>

namespace quendra::platform::windows {

/// A hidden window that the system tells of one dial. The windows of the program's logic have numbers of the
/// program's own, which mean nothing to the system.
class DialRelay {
 public:
  using Hear = std::function<void(std::uint32_t state, std::uint32_t error)>;

  explicit DialRelay(Hear hear);
  ~DialRelay();
  DialRelay(const DialRelay&) = delete;
  DialRelay& operator=(const DialRelay&) = delete;

  /// nullptr where the system has none left.
  HWND Window() const { return window_; }

 private:
  static LRESULT CALLBACK Receive(HWND window, UINT message, WPARAM state, LPARAM error);
  bool Pass(UINT message, WPARAM state, LPARAM error) noexcept;

  const Hear hear_;
  const UINT told_;
  HWND window_ = nullptr;
};

} // namespace quendra::platform::windows
