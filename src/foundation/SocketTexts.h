#pragma once

#include "runtime/Text.h"

namespace quendra::foundation {

/// A name as the library takes it: what stands behind a NUL isn't there.
std::string LibraryName(const Text& name);

} // namespace quendra::foundation
