#pragma once

#include "platform/registry/RegistryNumbers.h"

#include <string>
#include <vector>

namespace quendra::platform {

// Which paths and names every registry takes.

bool IsRegistryRoot(RegistryKey key);

/// The names of a path up to its NUL; an error number for a path with an empty name in it, as before a
/// leading backslash and behind a trailing one, and for names and depths that the system refuses.
std::uint32_t NamesOfRegistryPath(const std::string& path, std::vector<std::string>& names);

/// The name of a value up to its NUL.
std::uint32_t NameOfRegistryValue(const std::string& given, std::string& name);

} // namespace quendra::platform
