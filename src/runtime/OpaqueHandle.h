#pragma once

#include <compare>
#include <cstdint>
#include <functional>

namespace quendra {

/// An opaque 32-bit value that stands for something of the system's or the desktop's. Handles of different
/// kinds do not mix, nor with numbers: where one crosses as a number (the wParam of a message, a record's
/// field), the code says so.
template <typename Kind> class OpaqueHandle {
 public:
  /// 0, which stands for nothing in most kinds.
  constexpr OpaqueHandle() = default;
  explicit constexpr OpaqueHandle(std::uint32_t value) : value_(value) {}

  constexpr std::uint32_t Value() const { return value_; }

  friend constexpr auto operator<=>(OpaqueHandle, OpaqueHandle) = default;
  template <typename Stream, typename = typename Stream::char_type>
  friend Stream& operator<<(Stream& stream, OpaqueHandle handle) {
    stream << handle.value_;
    return stream;
  }

 private:
  std::uint32_t value_ = 0;
};

/// A window, to which the machine sends messages and the desktop gives them.
using WindowHandle = OpaqueHandle<struct WindowKind>;
inline constexpr WindowHandle kNoWindow;

} // namespace quendra

template <typename Kind> struct std::hash<quendra::OpaqueHandle<Kind>> {
  std::size_t operator()(quendra::OpaqueHandle<Kind> handle) const noexcept {
    return std::hash<std::uint32_t>()(handle.Value());
  }
};
