#pragma once

#include <cstdint>
#include <poll.h>
#include <string>
#include <vector>

namespace quendra::integration {

/// What stands before the bytes of a request.
struct RequestHead {
  std::uint32_t request = 0; ///< length of all of it, this head included
  std::uint32_t reply = 0;   ///< bytes that are to come back
};

/// A server process's work: answers each request with as many bytes as it asks for, and gives datagrams back.
class TrafficServer {
 public:
  TrafficServer(const std::string& address, std::uint16_t port);
  /// Until the channel closes.
  void Run(int channel);

 private:
  bool ServeRequest(int connection);

  int listener_;
  int datagrams_;
  std::uint16_t port_;
  std::vector<pollfd> polled_;
};

} // namespace quendra::integration
