#pragma once

#include "platform/system/PerformanceData.h"

namespace quendra::platform::unavailable {

/// A system that measures nothing.
class UnavailablePerformanceData : public PerformanceData {
 public:
  std::uint32_t Query(const std::string&, std::span<std::uint8_t>) override { return kErrorFileNotFound; }
};

} // namespace quendra::platform::unavailable
