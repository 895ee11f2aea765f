#pragma once

#include "runtime/Text.h"

#include <array>
#include <cstdint>

namespace quendra::platform {
class Icmp;
}

namespace quendra::diagnostics {

/// One echo to one address.
class mdlPing {
 public:
  explicit mdlPing(platform::Icmp& icmp) : icmp_(icmp) {}

  /// The echo reply record with the room behind it for its data.
  using Reply = std::array<std::uint8_t, 280>;
  static constexpr std::int32_t kNotSent = -1;

  /// Gives the status of the reply, 0 for success; where nobody replied, the number of the failure. kNotSent
  /// for what is no address or 0.0.0.0, and without an ICMP handle: then `reply` stays as it was. Names are
  /// not resolved.
  std::int32_t Ping(const Text& address, Reply& reply);

 private:
  platform::Icmp& icmp_;
};

} // namespace quendra::diagnostics
