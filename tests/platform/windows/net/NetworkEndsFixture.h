#pragma once

#include "platform/BackendFixture.h"
#include "platform/windows/net/SocketLibrary.h"

#include <vector>

namespace quendra::platform::windows {

/// Sockets of the asking process on loopback that are none of the machine's: what the tests of every machine
/// ask of a network.
class NetworkEnds {
 public:
  NetworkEnds();
  ~NetworkEnds();
  NetworkEnds(const NetworkEnds&) = delete;

  std::uint16_t Listen();
  std::uint16_t Connect(std::uint16_t port);
  SocketAddress Outside();
  std::unique_ptr<FarEnd> TakeConnection();

 private:
  SOCKET NewSocket();
  std::uint16_t PortOf(SOCKET socket) const;

  const SocketLibrary library_;
  std::vector<SOCKET> sockets_;
};

} // namespace quendra::platform::windows
