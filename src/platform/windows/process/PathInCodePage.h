#pragma once

#include "runtime/Text.h"

namespace quendra::platform::windows {

/// The path of a file in our code page. One that the page can't hold is given by the system's short names, so
/// that it still leads to the file; where the drive has none, with "?" for what the page lacks.
std::string PathInCodePage(const Text& path);

} // namespace quendra::platform::windows
