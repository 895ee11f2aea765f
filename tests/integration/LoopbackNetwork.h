#pragma once

#include "integration/NetworkNamespace.h"

namespace quendra::integration {

/// A network of the test's own with nothing but loopback, whose clients take the ports that the program's
/// table can hold.
class LoopbackNetwork {
 public:
  LoopbackNetwork() {
    RunCommand("ip link set lo up");
    NetworkNamespace::Set("net/ipv4/ip_local_port_range", "1025 5000");
  }

 private:
  NetworkNamespace space_;
};

} // namespace quendra::integration
