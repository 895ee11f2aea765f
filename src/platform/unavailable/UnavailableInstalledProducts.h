#pragma once

#include "platform/mail/InstalledProducts.h"

namespace quendra::platform::unavailable {

/// A system without an installer, which has installed nothing.
class UnavailableInstalledProducts : public InstalledProducts {
 public:
  std::uint32_t MsiEnumProductsA(std::uint32_t, std::span<char>) override { return kNoMoreItems; }
};

} // namespace quendra::platform::unavailable
