#pragma once

#include "runtime/Text.h"

#include <cstdint>
#include <functional>
#include <span>

namespace quendra::diagnostics {

/// Finds the processors' idle times in a block of performance data. The block comes from outside: wherever it
/// leads beyond its end or in a circle, reading it fails with CPULoad's fault kNoPerformanceData.
class ProcessorBlockReader {
 public:
  using Bytes = std::span<const std::uint8_t>;

  /// Fails on a block without the signature.
  explicit ProcessorBlockReader(Bytes block);

  /// Faults kNoProcessorObject and, from FindCounter, kNoUsageCounter when there is none.
  void FindObject();
  void FindCounter();
  /// Calls `take` with the name and the counter of each instance.
  void ForEachInstance(const std::function<void(const Text& name, std::uint64_t value)>& take) const;
  std::span<const std::uint8_t, 16> SystemTime() const;

 private:
  std::uint32_t Read32(std::size_t at) const;
  std::uint64_t Read64(std::size_t at) const;
  Text ReadName(std::size_t at, std::size_t bytes) const;
  /// The place so many bytes further on; fails when the record there is shorter than `least`.
  std::size_t Beyond(std::size_t at, std::uint32_t length, std::size_t least) const;
  void Require(bool holds) const;

  Bytes block_;
  std::size_t object_ = 0;
  std::uint32_t counterOffset_ = 0;
};

} // namespace quendra::diagnostics
