#include "diagnostics/load/CPULoadError.h"

#include <algorithm>
#include <array>

namespace quendra::diagnostics {

namespace {

struct ErrorRow {
  CPULoad::Error error;
  const char16_t* text;
  const char16_t* source;
};

constexpr std::array<ErrorRow, 6> kErrors{{
    {CPULoad::kNoVersion, u"Can't get the Windows version", u"CPULoad.Initialize"},
    // The name in the source is not quite that of the operation; people look for it as it is.
    {CPULoad::kNoMonitoring, u"Unable to start performance monitoring", u"CPULoad.CollectCPRData()"},
    {CPULoad::kIndexOutOfBounds, u"CPU index out of bounds", u"CPULoad.GetCPUUsage()"},
    {CPULoad::kNoProcessorObject, u"Unable to locate the 'Processor' performance object",
     u"CPULoad.CollectData"},
    {CPULoad::kNoUsageCounter, u"Unable to locate the '% of CPU usage' performance counter",
     u"CPULoad.CollectData"},
    {CPULoad::kNoPerformanceData, u"Unable to read performance data", u"CPULoad.CollectCPUData()"},
}};

} // namespace

Fault CpuLoadFault(CPULoad::Error error) {
  const auto& row = *std::ranges::find(kErrors, error, &ErrorRow::error);
  return {static_cast<int>(error), row.text, row.source};
}

} // namespace quendra::diagnostics
