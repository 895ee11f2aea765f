#pragma once

#include "runtime/Text.h"

#include <string>
#include <string_view>

namespace quendra::platform::linux_ {

/// A file's or process's name, raw bytes of this system, in the code page. Control characters and marks that
/// change the direction of what follows become "?", like any other character that such a name can't hold.
std::string SystemName(std::string_view raw);

/// A text of a file for people to read: controls become blanks, direction marks go, 255 code units stay.
Text ReadableText(std::string_view utf8);

} // namespace quendra::platform::linux_
