#pragma once

#include "platform/linux/system/Descriptor.h"

#include <cstdint>
#include <span>
#include <vector>

namespace quendra::platform::linux_ {

/// A TCP socket over IPv4. Addresses and ports are as they lie in memory (network order).
struct TcpSocket {
  std::uint32_t state = 0; ///< 1 to 12, as the owner table numbers them
  std::uint32_t localAddress = 0;
  std::uint32_t remoteAddress = 0;
  std::uint16_t localPort = 0;
  std::uint16_t remotePort = 0;
  std::uint32_t node = 0; ///< the socket's own number, 0 when no process has it any more or yet
  std::uint32_t user = 0;
};

/// Asks the kernel for all TCP sockets of this network namespace.
class SocketDiagnostics {
 public:
  /// Replaces `sockets` by those over IPv4: of the IPv4 family, of the IPv6 family with two IPv4-mapped
  /// addresses, and listeners on every address of both families. False on failure, with `sockets` in any
  /// state.
  bool Read(std::vector<TcpSocket>& sockets);

  enum class Progress { More, Done, Failed };
  /// Takes up one datagram of the kernel's answer to request `sequence`, which may be of any length.
  static Progress TakeUp(std::span<const std::uint8_t> datagram, std::uint32_t sequence,
                         std::vector<TcpSocket>& sockets);

  /// More than these are left out.
  static constexpr std::size_t kMostSockets = 65536;

 private:
  bool Open();
  bool Request();
  bool Receive(std::vector<TcpSocket>& sockets);

  Descriptor netlink_;
  std::uint32_t sequence_ = 0;
  std::vector<std::uint8_t> buffer_;
};

} // namespace quendra::platform::linux_
