#pragma once

#include "runtime/Text.h"

namespace quendra::provisioning {

/// What the subscriber reads of a state of a dial.
Text DialStateText(std::uint32_t state);

} // namespace quendra::provisioning
