#pragma once

#include "platform/net/TcpTableEntry.h"

namespace quendra::platform {

/// Dormant: what of the IP helper library only the sweep of connections asks, and nothing starts that.
class TcpEntryChange {
 public:
  virtual ~TcpEntryChange() = default;

  /// A TcpTableEntry without its owner, with the state kTcpDelete. 0 on success.
  virtual std::uint32_t
  SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record) = 0;
};

} // namespace quendra::platform
