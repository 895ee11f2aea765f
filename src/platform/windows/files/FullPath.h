#pragma once

#include "runtime/Text.h"

namespace quendra::platform::windows {

/// Whether a path names a file from a drive on, such as "C:\WINDOWS\name": no part of it is empty, leads up
/// or aside, or would be of another kind. What the system makes of others depends on the working folder.
bool IsFullPath(TextView path);

} // namespace quendra::platform::windows
