#pragma once

#include "platform/system/KeyboardLayout.h"

namespace quendra::platform::linux_ {

/// The layout that is active in the session, asked for anew each time. A program that shows its windows on an
/// X display is told by the display; in other sessions by the session's service for layouts, where it has
/// one.
class LinuxKeyboardLayout : public KeyboardLayout {
 public:
  std::optional<std::string> GetKeyboardLayoutNameA() override;
};

} // namespace quendra::platform::linux_
