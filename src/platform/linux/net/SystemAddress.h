#pragma once

#include "platform/net/Sockets.h"

#include <netinet/in.h>

namespace quendra::platform::linux_ {

/// An address of the socket library as this system's calls take it, and back.
inline sockaddr_in SystemAddress(const SocketAddress& address) {
  sockaddr_in system{};
  system.sin_family = AF_INET;
  system.sin_addr.s_addr = address.address.InMemory();
  system.sin_port = htons(address.port);
  return system;
}

inline SocketAddress LibraryAddress(const sockaddr_in& system) {
  return {Ipv4Address::FromMemory(system.sin_addr.s_addr), ntohs(system.sin_port)};
}

} // namespace quendra::platform::linux_
