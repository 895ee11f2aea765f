#pragma once

#include "runtime/ByteFields.h"

#include <cstdint>
#include <span>

/// The layout of the table of TCP connections with their owners: a 32-bit count, low byte first, then the
/// entries.
namespace quendra::platform {

/// States of connections, as the tables number them.
enum TcpState : std::uint32_t {
  kTcpClosed = 1,
  kTcpListening = 2,
  kTcpSynSent = 3,
  kTcpSynReceived = 4,
  kTcpEstablished = 5,
  kTcpFinWait1 = 6,
  kTcpFinWait2 = 7,
  kTcpCloseWait = 8,
  kTcpClosing = 9,
  kTcpLastAck = 10,
  kTcpTimeWait = 11,
  kTcpDelete = 12,
};

/// One entry. Addresses and ports (low 16 bits) are in network order as they lie in memory.
struct TcpTableEntry {
  static constexpr std::size_t kBytes = 24;
  /// Where the first entry stands in a table, after the count.
  static constexpr std::size_t kFirstOffset = 4;
  /// Without the owner it is the record that SetTcpEntry takes.
  static constexpr std::size_t kBytesWithoutOwner = 20;

  std::uint32_t state = 0;
  std::uint32_t localAddress = 0;
  std::uint32_t localPort = 0;
  std::uint32_t remoteAddress = 0;
  std::uint32_t remotePort = 0;
  std::uint32_t owner = 0;

  /// `bytes` hold the whole entry, here and below.
  static TcpTableEntry ReadFrom(std::span<const std::uint8_t> bytes, std::size_t at) {
    return {Little32(bytes, at),      Little32(bytes, at + 4),  Little32(bytes, at + 8),
            Little32(bytes, at + 12), Little32(bytes, at + 16), Little32(bytes, at + 20)};
  }
  void WriteTo(std::span<std::uint8_t> bytes, std::size_t at) const {
    for (const std::uint32_t field : {state, localAddress, localPort, remoteAddress, remotePort, owner}) {
      PutLittle32(bytes, at, field);
      at += sizeof field;
    }
  }
};

/// A port as it lies in memory in network order, and back.
constexpr std::uint32_t PortInMemory(std::uint16_t port) {
  return static_cast<std::uint32_t>(port >> 8 | (port & 0xFF) << 8);
}
constexpr std::uint16_t PortOfMemory(std::uint32_t word) {
  return static_cast<std::uint16_t>((word & 0xFF) << 8 | (word >> 8 & 0xFF));
}

} // namespace quendra::platform
