#pragma once

#include "runtime/Text.h"

namespace quendra::foundation {

/// An address as it lies in memory, in dotted decimal.
Text DottedAddress(std::uint32_t address);

} // namespace quendra::foundation
