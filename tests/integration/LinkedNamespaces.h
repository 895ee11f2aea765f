#pragma once

#include "integration/NetworkNamespace.h"

#include <memory>

namespace quendra::integration {

/// This host and another one on a link of their own: without offloads, so that a frame is what a wire would
/// carry, with fixed neighbours, and with client ports from 1025 to 5000. The thread is on this host.
class LinkedNamespaces {
 public:
  static constexpr const char* kNearAddress = "10.9.0.1";
  static constexpr const char* kFarAddress = "10.9.0.2";
  static constexpr const char* kNearLink = "qnear";

  LinkedNamespaces() {
    near_ = std::make_unique<NetworkNamespace>();
    far_ = std::make_unique<NetworkNamespace>();
    MakeLink();
  }

  /// Makes the link; again, when it has been taken away.
  void MakeLink() {
    near_->Enter();
    const std::string far = "/proc/" + std::to_string(getpid()) + "/fd/" + std::to_string(far_->Descriptor());
    RunCommand("ip link add qnear address 02:00:00:00:00:01 type veth peer name qfar address "
               "02:00:00:00:00:02 netns " +
               far);
    SetUpEnd("qnear", kNearAddress, kFarAddress, "02:00:00:00:00:02");
    RunCommand(std::string("ip route add default via ") + kFarAddress);
    far_->Enter();
    SetUpEnd("qfar", kFarAddress, kNearAddress, "02:00:00:00:00:01");
    near_->Enter();
  }

  const NetworkNamespace& Near() const { return *near_; }
  const NetworkNamespace& Far() const { return *far_; }

 private:
  static void SetUpEnd(const std::string& end, const std::string& address, const std::string& other,
                       const std::string& otherHardware) {
    NetworkNamespace::Set("net/ipv4/ip_local_port_range", "1025 5000");
    RunCommand("ip link set lo up && ip addr add " + address + "/24 dev " + end + " && ip link set " + end +
               " up");
    RunCommand("ip neigh replace " + other + " lladdr " + otherHardware + " nud permanent dev " + end);
    RunCommand("ethtool -K " + end + " tx off rx off sg off tso off gso off gro off >/dev/null");
  }

  // The far one was made from within the near one and goes back there.
  std::unique_ptr<NetworkNamespace> near_;
  std::unique_ptr<NetworkNamespace> far_;
};

} // namespace quendra::integration
