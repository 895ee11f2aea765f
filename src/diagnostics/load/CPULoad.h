#pragma once

#include "platform/registry/Registry.h"
#include "platform/system/PerformanceData.h"
#include "platform/system/System.h"
#include "runtime/Text.h"

#include <vector>

namespace quendra::diagnostics {

/// How busy each processor is, in whole per cent: between two samples of the performance data on the NT
/// family, by a ready figure of the registry on the older one.
class CPULoad {
 public:
  /// What goes wrong, as faults of these numbers.
  enum Error : std::uint32_t {
    kNoVersion = 0x80041F41,
    kNoMonitoring = 0x80041F42,
    kIndexOutOfBounds = 0x80041F43,
    kNoProcessorObject = 0x80041F44,
    kNoUsageCounter = 0x80041F45,
    kNoPerformanceData = 0x80041F46,
  };

  CPULoad(platform::System& system, platform::PerformanceData& performance, platform::Registry& registry);
  ~CPULoad() { StopStatistics(); }
  CPULoad(const CPULoad&) = delete;
  CPULoad& operator=(const CPULoad&) = delete;

  /// Takes one sample.
  void CollectCPUData();
  std::int32_t GetCPUCount();
  /// `index` is 1 for the first processor. 0 as long as there is one sample.
  std::int32_t GetCPUUsage(std::int32_t index);

 private:
  void CollectOfNt();
  std::vector<std::uint8_t> QueryProcessors();
  void TakeIdle(const Text& processor, std::uint64_t idle);
  std::int32_t UsageOfNt(std::int32_t index);

  void CollectOfWin9x();
  void StartStatistics();
  void StopStatistics();
  void ReadWin9xUsage(platform::RegistryKey key);
  std::int32_t UsageOfWin9x(std::int32_t index);

  platform::System& system_;
  platform::PerformanceData& performance_;
  platform::Registry& registry_;

  std::int32_t CpuCount = -1; ///< until known
  std::int32_t BufferSize = 4096;
  bool IsNT = false;
  bool Win9xStarted = false;
  std::int32_t Win9xUsage = 0;
  platform::RegistryKey Win9xKey;
  std::vector<std::uint64_t> CurrentIdle, PreviousIdle;
  std::uint64_t CurrentTime = 0, PreviousTime = 0;
};

} // namespace quendra::diagnostics
