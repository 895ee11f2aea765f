#pragma once

#include "runtime/Text.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

/// The layout of a block of performance data: a header, then objects, each with its header, the definitions
/// of its counters, and its instances with their counters.
namespace quendra::platform {

/// The processor's object and its counter of idle time, in units of 100 ns.
inline constexpr std::uint32_t kProcessorObject = 238;
inline constexpr std::uint32_t kProcessorTimeCounter = 6;

/// Offsets are from the record's own start.
struct PerformanceBlock {
  static constexpr std::string_view kSignature = "PERF";
  static constexpr std::size_t kBytes = 88;
  static constexpr std::size_t kLittleEndian = 8;
  static constexpr std::size_t kVersion = 12;
  static constexpr std::size_t kRevision = 16;
  static constexpr std::size_t kTotalByteLength = 20;
  static constexpr std::size_t kHeaderLength = 24;
  static constexpr std::size_t kNumObjectTypes = 28;
  static constexpr std::size_t kDefaultObject = 32;
  static constexpr std::size_t kSystemTime = 36;
};
struct PerformanceObject {
  static constexpr std::size_t kBytes = 64;
  static constexpr std::size_t kTotalByteLength = 0;
  static constexpr std::size_t kDefinitionLength = 4;
  static constexpr std::size_t kHeaderLength = 8;
  static constexpr std::size_t kNameTitleIndex = 12;
  static constexpr std::size_t kNumCounters = 32;
  static constexpr std::size_t kNumInstances = 40;
};
struct PerformanceCounter {
  static constexpr std::size_t kBytes = 40;
  static constexpr std::size_t kByteLength = 0;
  static constexpr std::size_t kNameTitleIndex = 4;
  static constexpr std::size_t kCounterType = 28;
  static constexpr std::size_t kCounterSize = 32;
  static constexpr std::size_t kCounterOffset = 36;
  /// A time in units of 100 ns that tells what was not used.
  static constexpr std::uint32_t kInverseTimer = 0x21510500;
};
struct PerformanceInstance {
  static constexpr std::size_t kBytes = 24;
  static constexpr std::size_t kByteLength = 0;
  static constexpr std::size_t kUniqueId = 12;
  static constexpr std::size_t kNameOffset = 16;
  static constexpr std::size_t kNameLength = 20;
};

/// One processor, or all of them as "_Total".
struct ProcessorTimes {
  Text name{};
  std::uint64_t idle = 0;
};

/// A block that holds the processor object alone, taken at this moment.
std::vector<std::uint8_t> ProcessorBlock(std::span<const ProcessorTimes> processors, std::uint64_t fileTime);

} // namespace quendra::platform
