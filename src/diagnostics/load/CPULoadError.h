#pragma once

#include "diagnostics/load/CPULoad.h"
#include "runtime/Fault.h"

namespace quendra::diagnostics {

/// The fault of this number with its text and its source.
Fault CpuLoadFault(CPULoad::Error error);

} // namespace quendra::diagnostics
