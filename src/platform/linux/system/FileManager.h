#pragma once

#include <string>

namespace quendra::platform::linux_ {

/// Has the session's file manager show a file in its folder, through the session bus. False without the bus
/// library or a session bus, and when no file manager can be asked, or it refuses, or needs
/// more than three seconds to start or one to answer.
bool ShowInFileManager(const std::string& path);

/// "file://" and the path with every byte escaped that is more than a letter, a digit or a harmless sign.
std::string FileUri(const std::string& path);

} // namespace quendra::platform::linux_
