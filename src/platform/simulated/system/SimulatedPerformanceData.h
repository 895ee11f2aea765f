#pragma once

#include "platform/system/PerformanceBlock.h"
#include "platform/system/PerformanceData.h"

#include <algorithm>

namespace quendra::platform::simulated {

/// A block that the test gives, byte by byte or by the idle times of the processors.
class SimulatedPerformanceData : public PerformanceData {
 public:
  std::vector<std::uint8_t> Block;
  /// Other than 0: what Query fails with.
  std::uint32_t Error = 0;
  /// The names that were asked for, and the room that each question gave.
  std::vector<std::string> Names;
  std::vector<std::size_t> Rooms;

  void SetProcessors(const std::vector<ProcessorTimes>& processors, std::uint64_t fileTime) {
    Block = ProcessorBlock(processors, fileTime);
  }

  std::uint32_t Query(const std::string& valueName, std::span<std::uint8_t> buffer) override {
    Names.push_back(valueName);
    Rooms.push_back(buffer.size());
    if (Error != 0) return Error;
    if (buffer.size() < Block.size()) return kErrorMoreData;
    std::ranges::copy(Block, buffer.begin());
    return 0;
  }
};

} // namespace quendra::platform::simulated
