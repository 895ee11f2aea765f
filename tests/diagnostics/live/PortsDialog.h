#pragma once

#include "diagnostics/dialogs/frmPortsChecks.h"

namespace quendra::diagnostics {

/// Whether each of the three ports has its result.
inline bool HasAllResults(const frmPortsChecks& dialog) {
  return !dialog.Label3.Caption().empty() && !dialog.Label4.Caption().empty() &&
         !dialog.Label6.Caption().empty();
}

} // namespace quendra::diagnostics
