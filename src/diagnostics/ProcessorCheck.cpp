#include "diagnostics/ProcessorCheck.h"

#include "diagnostics/load/CPULoad.h"

namespace quendra::diagnostics {

Outcome ProcessorCheck::Run(CheckRows& rows) {
  CPULoad load(system_, performance_, registry_);
  double sum = 0;
  TakeReadings(rows, system_, [&] {
    load.CollectCPUData();
    sum += load.GetCPUUsage(1);
  });
  return ShowLoad(rows, sum / kReadings);
}

} // namespace quendra::diagnostics
