#include "platform/simulated/icmp/ScriptedRoute.h"

#include "platform/icmp/IcmpNumbers.h"
#include "platform/simulated/SimulatedCore.h"

namespace quendra::platform::simulated {

ScriptedRoute& ScriptedRoute::Hop(const std::string& address, std::uint32_t delay) {
  hops_.push_back(Answer{AddressOf(address), kEchoTtlExpiredInTransit, delay});
  return *this;
}

ScriptedRoute& ScriptedRoute::SilentHop() {
  hops_.push_back(std::nullopt);
  return *this;
}

ScriptedRoute& ScriptedRoute::Target(std::uint32_t delay) { return TargetWithStatus(kEchoSuccess, delay); }

ScriptedRoute& ScriptedRoute::TargetWithStatus(std::uint32_t status, std::uint32_t delay) {
  target_ = Answer{{}, status, delay};
  return *this;
}

ScriptedRoute& ScriptedRoute::Lose(int echoes) {
  toLose_ += echoes;
  return *this;
}

std::optional<ScriptedRoute::Answer> ScriptedRoute::Send(Ipv4Address target, std::uint8_t ttl) {
  if (toLose_ > 0) {
    --toLose_;
    return {};
  }
  if (ttl >= 1 && ttl <= hops_.size()) return hops_[ttl - 1u];
  auto answer = target_;
  if (answer) answer->address = target;
  return answer;
}

} // namespace quendra::platform::simulated
