#pragma once

#include "platform/linux/process/ProcFolder.h"
#include "platform/system/PerformanceBlock.h"
#include "platform/system/PerformanceData.h"

#include <functional>

namespace quendra::platform::linux_ {

/// Hundreds of nanoseconds since the start of 1601.
using FileTimeClock = std::function<std::uint64_t()>;
std::uint64_t FileTimeNow();

/// The processors' idle times from the kernel's figures. No other object is measured.
class LinuxPerformanceData : public PerformanceData {
 public:
  explicit LinuxPerformanceData(const ProcFolder& folder, FileTimeClock clock = FileTimeNow);

  std::uint32_t Query(const std::string& valueName, std::span<std::uint8_t> buffer) override;

 private:
  /// One figure for each processor that was there at the start, and the total: whoever counted processors
  /// then has room for no more. A figure never falls, though the kernel's time of waiting for disks may.
  std::vector<ProcessorTimes> Processors();
  std::vector<ProcessorTimes> Read() const;

  const ProcFolder& folder_;
  FileTimeClock clock_;
  std::vector<ProcessorTimes> last_;
};

} // namespace quendra::platform::linux_
