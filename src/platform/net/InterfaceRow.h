#pragma once

#include "runtime/ByteFields.h"

#include <array>
#include <cstdint>
#include <span>

/// The layout of the table of network interfaces (MIB_IFTABLE): a 32-bit count, low byte first, then the rows
/// (MIB_IFROW).
namespace quendra::platform {

/// Kinds of interfaces, and what the administrator wants of one and what it does, as the table numbers them.
enum InterfaceKind : std::uint32_t {
  kOtherInterface = 1,
  kEthernetInterface = 6,
  kPppInterface = 23,
  kLoopbackInterface = 24,
  kTunnelInterface = 131,
};
enum InterfaceAdminStatus : std::uint32_t { kAdminUp = 1, kAdminDown = 2 };
enum InterfaceOperStatus : std::uint32_t {
  kNonOperational = 0,
  kUnreachable = 1,
  kDisconnected = 2,
  kConnecting = 3,
  kConnected = 4,
  kOperational = 5,
};

/// One row. Texts stand in it as they cross the seam: the name in 16-bit characters, the description in the
/// system's code page.
struct InterfaceRow {
  static constexpr std::size_t kBytes = 860;
  /// Where the first row stands in a table, after the count.
  static constexpr std::size_t kFirstOffset = 4;
  static constexpr std::size_t kNameBytes = 512;
  static constexpr std::size_t kAddressOffset = 532;
  static constexpr std::size_t kAddressBytes = 8;
  static constexpr std::size_t kDescriptionOffset = 604;
  static constexpr std::size_t kDescriptionBytes = 256;

  /// Where each 32-bit field stands.
  enum Field : std::size_t {
    kIndex = 512,
    kType = 516,
    kMtu = 520,
    kSpeed = 524,
    kAddressLength = 528,
    kAdminStatus = 540,
    kOperStatus = 544,
    kLastChange = 548,
    kInOctets = 552,
    kInUnicast = 556,
    kInNonunicast = 560,
    kInDiscards = 564,
    kInErrors = 568,
    kInUnknownProtocols = 572,
    kOutOctets = 576,
    kOutUnicast = 580,
    kOutNonunicast = 584,
    kOutDiscards = 588,
    kOutErrors = 592,
    kOutQueueLength = 596,
    kDescriptionLength = 600,
  };

  using Image = std::array<std::uint8_t, kBytes>;

  std::uint32_t Get(Field field) const { return Little32(bytes, field); }
  void Set(Field field, std::uint32_t value) { PutLittle32(bytes, field, value); }

  Image bytes{};
};

/// What GetIfTable leaves of these rows, and what it gives.
std::uint32_t PutInterfaceTable(std::span<const InterfaceRow> rows, std::span<std::uint8_t> buffer,
                                std::uint32_t& size);

} // namespace quendra::platform
