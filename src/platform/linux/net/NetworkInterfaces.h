#pragma once

#include "platform/linux/net/DefaultRoute.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// An interface that is up and has IPv4 addresses.
struct NetworkInterface {
  std::string name;
  bool isLoopback = false;
  bool hasDefaultRoute = false;
  std::vector<Ipv4Address> addresses; ///< the main one first
  std::vector<Ipv4Address> gateways;  ///< of default routes, the preferred one first
  std::uint32_t metric = 0;           ///< of the preferred default route
};

/// Of this network namespace, in the kernel's order.
std::vector<NetworkInterface> ReadNetworkInterfaces(const ProcFolder& folder);

/// Loopback first, the interface that the preferred default route uses last; an interface's main address last
/// of its own.
std::vector<Ipv4Address> HostAddressOrder(std::vector<NetworkInterface> interfaces);

} // namespace quendra::platform::linux_
