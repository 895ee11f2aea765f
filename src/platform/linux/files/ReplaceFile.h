#pragma once

#include "platform/linux/system/Descriptor.h"

#include <string>

namespace quendra::platform::linux_ {

/// Puts a file with these bytes, for the user alone, into an open folder, in place of one of that name. The
/// bytes are written under another name first, so that under this one there is always the old file or the
/// whole new one, whatever breaks off. 0, or the system's error number: EEXIST where something stands that is
/// no file, EACCES where a file may not be written.
int ReplaceFile(const Descriptor& folder, const std::string& name, const std::string& bytes);

} // namespace quendra::platform::linux_
