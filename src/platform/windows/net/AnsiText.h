#pragma once

#include "runtime/Text.h"

namespace quendra::platform::windows {

/// A text of the older calls, which are in the machine's own code page.
Text FromAnsi(std::string_view bytes);

} // namespace quendra::platform::windows
