#pragma once

#include <cstdint>

namespace quendra::platform {

/// What the methods of network cards give, as far as a backend names them.
enum NetworkCardResult : std::uint32_t {
  kCardChanged = 0,
  kCardUnknownFailure = 65,
  kCardInvalidSubnetMask = 66,
  kCardInvalidParameter = 68,
  kCardInvalidAddress = 70,
  kCardInvalidGateway = 71,
  kCardAccessDenied = 91,
};

} // namespace quendra::platform
