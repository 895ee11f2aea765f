// Any bytes as the block of performance data.

#include "diagnostics/load/CPULoad.h"
#include "platform/simulated/registry/SimulatedRegistry.h"
#include "platform/simulated/system/SimulatedPerformanceData.h"
#include "platform/simulated/system/SimulatedSystem.h"
#include "runtime/Fault.h"

#include <cstdlib>

namespace {

using namespace quendra;
using diagnostics::CPULoad;

/// The faults that a block may raise: what it lacks, a processor that isn't there, and figures without
/// bounds.
bool IsExpected(int number) {
  const auto code = static_cast<std::uint32_t>(number);
  return (code >= CPULoad::kNoProcessorObject && code <= CPULoad::kNoPerformanceData) ||
         number == Fault::kSubscript || number == Fault::kOverflow;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  platform::simulated::Core core;
  platform::simulated::SimulatedSystem system(core);
  platform::simulated::SimulatedPerformanceData performance;
  static platform::simulated::SimulatedRegistry registry;
  system.ProcessorCount = 2;
  CPULoad load(system, performance, registry);
  try {
    // Two samples: the first half and the second.
    for (const std::size_t start : {std::size_t{0}, size / 2}) {
      performance.Block.assign(data + start, data + size);
      load.CollectCPUData();
      load.GetCPUUsage(1);
    }
  } catch (const Fault& fault) {
    if (!IsExpected(fault.number)) std::abort();
  }
  return 0;
}
