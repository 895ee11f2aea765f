#pragma once

#include "diagnostics/LoadReadings.h"
#include "platform/registry/Registry.h"
#include "platform/system/PerformanceData.h"

namespace quendra::diagnostics {

/// Measures for three seconds how busy the first processor is.
class ProcessorCheck {
 public:
  ProcessorCheck(platform::System& system, platform::PerformanceData& performance,
                 platform::Registry& registry)
      : system_(system), performance_(performance), registry_(registry) {}

  Outcome Run(CheckRows& rows);

 private:
  platform::System& system_;
  platform::PerformanceData& performance_;
  platform::Registry& registry_;
};

} // namespace quendra::diagnostics
