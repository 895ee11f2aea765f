#pragma once

#include <string>

namespace quendra::platform::linux_ {

/// Has the session's file manager show a file in its folder, through the session bus. Doesn't wait for it.
/// False without the bus library, a session bus or a file manager that can be asked.
bool ShowInFileManager(const std::string& path);

/// "file://" and the path with every byte escaped that is more than a letter, a digit or a harmless sign.
std::string FileUri(const std::string& path);

} // namespace quendra::platform::linux_
