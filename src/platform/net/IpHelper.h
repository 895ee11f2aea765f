#pragma once

#include "platform/net/dormant/TcpEntryChange.h"

#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <vector>

namespace quendra::platform {

/// What the list of adapters tells of one adapter. Addresses are dotted texts; an unset one is empty.
struct AdapterRecord {
  std::string name;
  std::string description;
  std::vector<std::string> addresses;
  std::vector<std::string> gateways;
};

/// Tables of the IP helper library.
class IpHelper : public TcpEntryChange {
 public:
  using TcpTable = std::shared_ptr<const std::vector<std::uint8_t>>;

  /// What GetAdaptersInfo needs for one adapter.
  static constexpr std::uint32_t kAdapterBytes = 640;
  static constexpr std::uint32_t kErrorInsufficientBuffer = 122;
  static constexpr std::uint32_t kErrorBufferOverflow = 111;
  static constexpr std::uint32_t kErrorNotSupported = 50;

  /// The IPv4 TCP connections with their owners: a 32-bit count, low byte first, then the entries
  /// (TcpTableEntry). 0 on success; on failure `table` stays as it was.
  virtual std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) = 0;
  /// `size` counts bytes of room, kAdapterBytes an adapter. With less room than needed it gives
  /// kErrorBufferOverflow and puts the needed size in `size`; otherwise it gives 0 and fills `adapters`.
  virtual std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) = 0;
  /// The network interfaces: a 32-bit count, then the rows (InterfaceRow.h). Puts the needed size in `size`
  /// and fails with kErrorInsufficientBuffer when the buffer has less room.
  virtual std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool sorted) = 0;
};

} // namespace quendra::platform
