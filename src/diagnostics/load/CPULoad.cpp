#include "diagnostics/load/CPULoad.h"

#include "diagnostics/load/CPULoadError.h"
#include "diagnostics/load/ProcessorBlockReader.h"
#include "runtime/Format.h"
#include "runtime/Integers.h"

#include <optional>

namespace quendra::diagnostics {

namespace {

constexpr std::uint32_t kNtFamily = 2;
constexpr std::int32_t kBufferStep = 4096;
/// Far above any block; a system that asks for ever more is answered as one that has no data.
constexpr std::int32_t kMostBuffer = 1 << 20;

/// The number that a name holds; nothing for a name that isn't numeric.
std::optional<std::int32_t> NumberIn(const Text& name) {
  try {
    return RoundToInt32(NumberOf(name));
  } catch (const Fault& fault) {
    if (fault.number == Fault::kOverflow) throw;
    return {};
  }
}

double Difference(std::uint64_t now, std::uint64_t before) {
  return static_cast<double>(static_cast<std::int64_t>(now - before));
}

} // namespace

CPULoad::CPULoad(platform::System& system, platform::PerformanceData& performance,
                 platform::Registry& registry)
    : system_(system), performance_(performance), registry_(registry) {
  platform::OsVersion version;
  if (!system_.GetVersionExA(version)) throw CpuLoadFault(kNoVersion);
  IsNT = version.platformId == kNtFamily;
}

std::int32_t CPULoad::GetCPUCount() {
  if (CpuCount >= 1) return CpuCount;
  platform::SystemInfo info;
  system_.GetSystemInfo(info);
  CpuCount = ToInt32(info.numberOfProcessors);
  CurrentIdle.assign(info.numberOfProcessors, 0);
  PreviousIdle.assign(info.numberOfProcessors, 0);
  return CpuCount;
}

void CPULoad::CollectCPUData() { IsNT ? CollectOfNt() : CollectOfWin9x(); }

std::int32_t CPULoad::GetCPUUsage(std::int32_t index) {
  return IsNT ? UsageOfNt(index) : UsageOfWin9x(index);
}

std::vector<std::uint8_t> CPULoad::QueryProcessors() {
  std::vector<std::uint8_t> buffer(static_cast<std::size_t>(BufferSize));
  while (performance_.Query("238", buffer) == platform::PerformanceData::kErrorMoreData &&
         BufferSize < kMostBuffer) {
    BufferSize += kBufferStep;
    buffer.assign(static_cast<std::size_t>(BufferSize), 0);
  }
  return buffer;
}

void CPULoad::CollectOfNt() {
  const auto buffer = QueryProcessors();
  ProcessorBlockReader block(buffer);
  block.FindObject();
  if (CpuCount < 1) GetCPUCount();
  block.FindCounter();
  block.ForEachInstance([this](const Text& name, std::uint64_t idle) { TakeIdle(name, idle); });
  PreviousTime = CurrentTime;
  system_.SystemTimeToFileTime(block.SystemTime(), CurrentTime);
}

void CPULoad::TakeIdle(const Text& processor, std::uint64_t idle) {
  const auto number = NumberIn(processor);
  if (!number) return;
  if (*number < 0 || *number >= CpuCount) throw Fault(Fault::kSubscript);
  const auto place = static_cast<std::size_t>(*number);
  PreviousIdle[place] = CurrentIdle[place];
  CurrentIdle[place] = idle;
}

std::int32_t CPULoad::UsageOfNt(std::int32_t index) {
  if (CpuCount < 0) CollectCPUData();
  if (index < 1 || index > CpuCount) throw CpuLoadFault(kIndexOutOfBounds);
  if (CurrentTime == PreviousTime) return 0;
  const auto place = static_cast<std::size_t>(index - 1);
  const double idle =
      Difference(CurrentIdle[place], PreviousIdle[place]) / Difference(CurrentTime, PreviousTime);
  return RoundToInt32((1 - idle) * 100);
}

} // namespace quendra::diagnostics
