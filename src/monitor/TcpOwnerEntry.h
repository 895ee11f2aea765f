#pragma once

#include "platform/net/IpHelper.h"

namespace quendra::monitor {

/// One entry of the table of TCP connections with their owners, its fields as they lie in memory.
struct TcpOwnerEntry : platform::TcpTableEntry {
  /// True for an entry that stands for no connection and no listening port.
  bool IsBlank() const { return remoteAddress == 0 && remotePort == 0 && localPort == 0; }
  /// The local port as a number from 0 to 65535.
  std::uint32_t LocalPortNumber() const { return platform::PortOfMemory(localPort); }
};

/// How many whole entries the table holds, whatever its count claims beyond that.
std::int32_t TcpEntryCount(const platform::IpHelper::TcpTable& table);
/// The entry `offset` bytes after the table's count; all zero where the table holds no whole entry.
TcpOwnerEntry TcpEntryAt(const platform::IpHelper::TcpTable& table, std::int32_t offset);

} // namespace quendra::monitor
