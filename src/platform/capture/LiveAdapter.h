#pragma once

#include <string>
#include <vector>

namespace quendra::platform {

/// An adapter that frames can be captured from.
struct LiveAdapter {
  std::string name;        ///< the system's name, such as "eth0"
  std::string description; ///< UTF-8, such as "Ethernet (eth0)"
  unsigned number = 0;     ///< the system's; adapters that came first have lower ones
  bool hasDefaultRoute = false;
  bool isLoopback = false;
};

/// The adapter of the default route first, loopback last, others by their numbers: so the first adapter with
/// the host's address is the one that a subscriber means.
void PutInOrder(std::vector<LiveAdapter>& adapters);

} // namespace quendra::platform
