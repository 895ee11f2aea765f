#pragma once

#include "platform/net/InterfaceRow.h"
#include "platform/net/IpHelper.h"

#include <array>

namespace quendra::platform::simulated {

/// A TCP connection: addresses are dotted texts, ports plain numbers.
struct Connection {
  std::uint32_t state = kTcpEstablished;
  std::string localAddress{};
  std::uint16_t localPort = 0;
  std::string remoteAddress = "0.0.0.0";
  std::uint16_t remotePort = 0;
  std::uint32_t owner = 0;
};

class SimulatedIpHelper : public IpHelper {
 public:
  std::vector<Connection> Connections;
  /// Other than 0: what AllocateAndGetTcpExTableFromStack fails with.
  std::uint32_t TableError = 0;
  int TablesFetched = 0;
  std::vector<AdapterRecord> Adapters;
  /// Other than 0: what GetAdaptersInfo fails with.
  std::uint32_t AdaptersError = 0;

  /// The rows of GetIfTable in this order; the texts stand in their images.
  std::vector<InterfaceRow> Interfaces;
  /// Other than 0: what GetIfTable fails with, at once or only when it is given room.
  std::uint32_t InterfacesError = 0;
  std::uint32_t InterfacesErrorWithRoom = 0;
  /// Whether each call of GetIfTable asked for sorted rows.
  std::vector<bool> InterfaceCalls;

  // Dormant: the records that SetTcpEntry was given, and what it gives.
  std::vector<std::array<std::uint8_t, TcpTableEntry::kBytesWithoutOwner>> Deleted;
  std::uint32_t SetTcpEntryResult = 0;

  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) override;
  std::uint32_t SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record) override;
  std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) override;
  std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool sorted) override;
};

} // namespace quendra::platform::simulated
