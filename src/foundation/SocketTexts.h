#pragma once

#include "runtime/Text.h"

namespace quendra::foundation {

/// An address as it lies in memory, in dotted decimal.
Text DottedAddress(std::uint32_t address);

/// A name as the library takes it: what stands behind a NUL isn't there.
std::string LibraryName(const Text& name);

} // namespace quendra::foundation
