#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace quendra::platform::linux_ {

// The published name of a layout, its number in eight digits ("0000040D" is Hebrew), for the layouts that the
// program's users have; nothing for any other.

/// By the name that its keymap bears, as in "English (US)".
std::optional<std::string> LayoutNameOfKeymap(std::string_view keymap);
/// By the code under which a session offers it, as in "us".
std::optional<std::string> LayoutNameOfCode(std::string_view code);

} // namespace quendra::platform::linux_
