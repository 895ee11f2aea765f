#pragma once

#include <cstdint>
#include <span>
#include <string>

namespace quendra::platform {

/// The performance data of the machine, which the registry shows under HKEY_PERFORMANCE_DATA.
class PerformanceData {
 public:
  virtual ~PerformanceData() = default;

  static constexpr std::uint32_t kErrorFileNotFound = 2;
  static constexpr std::uint32_t kErrorMoreData = 234;

  /// Fills `buffer` with the block (PerformanceBlock.h) of the objects whose numbers the name holds, parted
  /// by blanks. 0, or the system's error number; kErrorMoreData when the block finds no room.
  virtual std::uint32_t Query(const std::string& valueName, std::span<std::uint8_t> buffer) = 0;
};

} // namespace quendra::platform
