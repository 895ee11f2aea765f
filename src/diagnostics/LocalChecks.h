#pragma once

#include "diagnostics/CacheCheck.h"
#include "diagnostics/LineCheck.h"
#include "diagnostics/ProcessorCheck.h"
#include "diagnostics/SharingCheck.h"

namespace quendra::diagnostics {

/// The checks of the surf page that ask the machine alone.
struct LocalChecks {
  CacheCheck cache;
  ProcessorCheck processor;
  LineCheck line;
  SharingCheck sharing;
};

} // namespace quendra::diagnostics
