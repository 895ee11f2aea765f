#pragma once

#include "platform/net/Ipv4Address.h"
#include "platform/windows/net/Winsock.h"

#include <vector>

namespace quendra::platform::windows {

/// The IPv4 addresses of what the system found for a name, in its order.
std::vector<Ipv4Address> AddressesOf(const hostent& entry);

} // namespace quendra::platform::windows
