#pragma once

#include "platform/net/Sockets.h"
#include "platform/net/TcpTableEntry.h"
#include "platform/windows/net/Winsock.h"

namespace quendra::platform::windows {

inline sockaddr_in SystemAddress(const SocketAddress& address) {
  sockaddr_in system{};
  system.sin_family = AF_INET;
  system.sin_port = static_cast<u_short>(PortInMemory(address.port));
  system.sin_addr.s_addr = address.address.InMemory();
  return system;
}

inline SocketAddress LibraryAddress(const sockaddr_in& system) {
  return {Ipv4Address::FromMemory(system.sin_addr.s_addr), PortOfMemory(system.sin_port)};
}

} // namespace quendra::platform::windows
