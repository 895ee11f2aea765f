#pragma once

#include "platform/system/KeyboardLayout.h"

namespace quendra::platform::windows {

/// The layout of the thread that asks, whose windows the user types in.
class WindowsKeyboardLayout : public KeyboardLayout {
 public:
  std::optional<std::string> GetKeyboardLayoutNameA() override;
};

} // namespace quendra::platform::windows
