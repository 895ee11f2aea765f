#include "diagnostics/load/CPULoad.h"
#include "diagnostics/load/CPULoadError.h"
#include "runtime/ByteFields.h"

#include <array>
#include <utility>

namespace quendra::diagnostics {

void CPULoad::ReadWin9xUsage(platform::RegistryKey key) {
  std::array<std::uint8_t, 4> bytes{};
  PutLittle32(bytes, 0, static_cast<std::uint32_t>(Win9xUsage));
  std::uint32_t type = 0;
  std::uint32_t size = bytes.size();
  registry_.RegQueryValueExA(key, "KERNEL\\CPUUsage", type, bytes, size);
  Win9xUsage = static_cast<std::int32_t>(Little32(bytes, 0));
}

void CPULoad::StartStatistics() {
  using namespace platform;
  RegistryKey start;
  if (registry_.RegOpenKeyExA(kDynData, "PerfStats\\StartStat", kKeyAllAccess, start) != kRegistrySuccess)
    throw CpuLoadFault(kNoMonitoring);
  // Reading the value is what switches the statistics on, and off below.
  ReadWin9xUsage(start);
  registry_.RegCloseKey(start);
  if (registry_.RegOpenKeyExA(kDynData, "PerfStats\\StatData", kKeyRead, Win9xKey) != kRegistrySuccess)
    throw CpuLoadFault(kNoPerformanceData);
  Win9xStarted = true;
}

void CPULoad::CollectOfWin9x() {
  if (!Win9xStarted) StartStatistics();
  ReadWin9xUsage(Win9xKey);
}

std::int32_t CPULoad::UsageOfWin9x(std::int32_t index) {
  if (index != 1) throw CpuLoadFault(kIndexOutOfBounds);
  if (!Win9xStarted) CollectCPUData();
  return Win9xUsage;
}

void CPULoad::StopStatistics() {
  using namespace platform;
  if (IsNT || !Win9xStarted) return;
  Win9xStarted = false;
  registry_.RegCloseKey(std::exchange(Win9xKey, kNoRegistryKey));
  RegistryKey stop;
  if (registry_.RegOpenKeyExA(kDynData, "PerfStats\\StopStat", kKeyAllAccess, stop) != kRegistrySuccess)
    return;
  ReadWin9xUsage(stop);
  registry_.RegCloseKey(stop);
}

} // namespace quendra::diagnostics
