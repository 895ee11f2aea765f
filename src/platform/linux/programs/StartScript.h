#pragma once

#include <string>

namespace quendra::platform::linux_ {

/// Whether a file belongs to the program that a script of its name starts: both lie where packages lay such a
/// pair, and nobody but the administrator can change either or put another in its place. The paths are free
/// of links. In doubt false: what a script does can't be told without running it.
bool IsProgramOfScript(const std::string& executable, const std::string& script);

} // namespace quendra::platform::linux_
