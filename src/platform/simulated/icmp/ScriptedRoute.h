#pragma once

#include "platform/net/Ipv4Address.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace quendra::platform::simulated {

/// The way to a host, router by router, as a test tells it:
/// `machine.icmp.RouteTo("192.0.2.1").Hop("10.0.0.138", 5).SilentHop().Target(12)`.
class ScriptedRoute {
 public:
  /// The next router, which answers that many milliseconds after the echo was sent.
  ScriptedRoute& Hop(const std::string& address, std::uint32_t delay = 1);
  /// The next router passes everything on and never answers itself.
  ScriptedRoute& SilentHop();
  /// The host itself, with its delay. Without it the host never answers.
  ScriptedRoute& Target(std::uint32_t delay = 1);
  /// The host gets the echo and refuses it with another status than success.
  ScriptedRoute& TargetWithStatus(std::uint32_t status, std::uint32_t delay = 1);
  /// Loses the next echoes on this route, however far they would go.
  ScriptedRoute& Lose(int echoes);

  struct Answer {
    Ipv4Address address;
    std::uint32_t status = 0;
    std::uint32_t delay = 0;
  };
  /// What an echo with that TTL brings; takes one off what is to be lost.
  std::optional<Answer> Send(Ipv4Address target, std::uint8_t ttl);

 private:
  std::vector<std::optional<Answer>> hops_;
  std::optional<Answer> target_;
  int toLose_ = 0;
};

} // namespace quendra::platform::simulated
