#pragma once

#include "diagnostics/interfaces/CInterface.h"
#include "platform/net/InterfaceRow.h"

namespace quendra::diagnostics {

/// The interface that a row tells of. Fault 9 for a physical address that is longer than its field.
CInterface InterfaceOf(const platform::InterfaceRow& row);

} // namespace quendra::diagnostics
