#pragma once

#include "platform/linux/net/NetlinkBytes.h"
#include "platform/net/InterfaceRow.h"

#include <array>
#include <string>

namespace quendra::platform::linux_ {

/// What the kernel tells of one link.
struct Link {
  /// Of octets, unicast and other packets, discards and errors that came in, then of those that went out, as
  /// kCounterFields has them.
  using Counters = std::array<std::uint64_t, 9>;

  InterfaceRow row; ///< without speed and counters
  std::string name;
  Counters counters{};
};

inline constexpr std::array<InterfaceRow::Field, 9> kCounterFields{
    InterfaceRow::kInOctets,   InterfaceRow::kInUnicast,   InterfaceRow::kInNonunicast,
    InterfaceRow::kInDiscards, InterfaceRow::kInErrors,    InterfaceRow::kOutOctets,
    InterfaceRow::kOutUnicast, InterfaceRow::kOutDiscards, InterfaceRow::kOutErrors,
};

/// Reads a message of type RTM_NEWLINK, without its netlink header; nothing when it isn't one.
std::optional<Link> LinkOf(NetlinkBytes message);

} // namespace quendra::platform::linux_
