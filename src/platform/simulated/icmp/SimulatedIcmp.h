#pragma once

#include "platform/icmp/Icmp.h"
#include "platform/simulated/SimulatedCore.h"
#include "platform/simulated/icmp/ScriptedRoute.h"

#include <set>

namespace quendra::platform::simulated {

/// Echoes over scripted routes. An echo moves the machine's clock by what its reply took, or by its time
/// limit. Where no route leads nobody answers.
class SimulatedIcmp : public Icmp {
 public:
  explicit SimulatedIcmp(Core& core) : core_(core) {}

  ScriptedRoute& RouteTo(const std::string& address) { return routes_[AddressOf(address)]; }
  /// No handle can be opened.
  bool FailHandle = false;
  /// Nor can one for want of this right.
  std::string LackedRight;

  /// What was sent.
  struct Sent {
    Ipv4Address address;
    std::uint8_t ttl = 0; ///< 128, the system's own, where no options were given
    std::string data;
    std::vector<std::uint8_t> options;
    std::size_t bufferSize = 0;
    std::uint32_t limit = 0;
  };
  std::vector<Sent> Echoes;
  std::size_t CountOpen() const { return open_.size(); }

  IcmpHandle IcmpCreateFile() override;
  std::string MissingRight() override { return LackedRight; }
  std::uint32_t IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                             std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) override;
  bool IcmpCloseHandle(IcmpHandle handle) override { return open_.erase(handle) > 0; }

 private:
  static constexpr std::uint8_t kOwnTtl = 128;

  Core& core_;
  std::map<Ipv4Address, ScriptedRoute> routes_;
  std::set<IcmpHandle> open_;
  std::uint32_t lastHandle_ = 0x500;
};

} // namespace quendra::platform::simulated
