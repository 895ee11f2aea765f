#pragma once

#include "runtime/Text.h"

namespace quendra::foundation {

/// A name as the library takes it: it ends at the first NUL.
std::string LibraryName(const Text& name);

} // namespace quendra::foundation
