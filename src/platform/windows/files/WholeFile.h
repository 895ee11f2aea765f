#pragma once

#include "runtime/Text.h"

#include <cstdint>

namespace quendra::platform::windows {

/// Puts a file with these bytes in the place of one of that name, or where there is none. The old one stands
/// until the new one is whole, and when it can't be. 0, or the system's error number.
std::uint32_t WriteWholeFile(const Text& path, const std::string& bytes);

} // namespace quendra::platform::windows
