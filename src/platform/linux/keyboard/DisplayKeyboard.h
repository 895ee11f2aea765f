#pragma once

#include <optional>
#include <string>

namespace quendra::platform::linux_ {

/// The name of the keymap with which the X display reads keys now, as in "English (US)". It is asked of the
/// keymap itself: a display within a session of another kind has a keymap of that session, and a property of
/// layouts that nobody keeps. Nothing without the display's library, a display or a keyboard extension.
std::optional<std::string> ActiveKeymap();

} // namespace quendra::platform::linux_
