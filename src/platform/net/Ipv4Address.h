#pragma once

#include "runtime/Text.h"

#include <array>
#include <compare>
#include <cstdint>
#include <functional>
#include <optional>

namespace quendra::platform {

/// An IPv4 address. Inside it is the number that its four bytes are as they lie in memory, the first one
/// lowest, as the published records hold it; what has the first byte highest (a prefix, a constant such as
/// 0x7F000001) says so by the maker that it uses.
class Ipv4Address {
 public:
  /// 0.0.0.0, which stands for any address and for none.
  constexpr Ipv4Address() = default;

  static constexpr Ipv4Address FromMemory(std::uint32_t number) { return Ipv4Address(number); }
  static constexpr Ipv4Address FromHost(std::uint32_t number) { return Ipv4Address(Reversed(number)); }
  /// A dotted text as AsText writes it: four parts from 0 to 255 in decimal, without leading zeros, blanks or
  /// anything else. The rules of Sockets::inet_addr are wider and its own.
  static std::optional<Ipv4Address> FromText(TextView text);
  static std::optional<Ipv4Address> FromText(std::string_view text);

  constexpr std::uint32_t InMemory() const { return number_; }
  constexpr std::uint32_t InHost() const { return Reversed(number_); }

  /// 0.0.0.0.
  constexpr bool IsAny() const { return number_ == 0; }
  /// 127 in its first part.
  constexpr bool IsLoopback() const { return (number_ & 0xFF) == 127; }

  Text AsText() const;
  std::string AsAscii() const;

  friend constexpr bool operator==(Ipv4Address, Ipv4Address) = default;
  /// By their parts, the first one first.
  friend constexpr std::strong_ordering operator<=>(Ipv4Address left, Ipv4Address right) {
    return left.InHost() <=> right.InHost();
  }
  template <typename Stream, typename = typename Stream::char_type>
  friend Stream& operator<<(Stream& stream, Ipv4Address address) {
    stream << address.AsAscii();
    return stream;
  }

 private:
  explicit constexpr Ipv4Address(std::uint32_t number) : number_(number) {}
  static constexpr std::uint32_t Reversed(std::uint32_t number) {
    return number >> 24 | (number >> 8 & 0xFF00) | (number & 0xFF00) << 8 | number << 24;
  }

  std::uint32_t number_ = 0;
};

} // namespace quendra::platform

template <> struct std::hash<quendra::platform::Ipv4Address> {
  std::size_t operator()(quendra::platform::Ipv4Address address) const noexcept {
    return std::hash<std::uint32_t>()(address.InMemory());
  }
};
