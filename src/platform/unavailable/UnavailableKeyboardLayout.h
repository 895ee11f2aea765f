#pragma once

#include "platform/system/KeyboardLayout.h"

namespace quendra::platform::unavailable {

/// A system that does not tell its layout.
class UnavailableKeyboardLayout : public KeyboardLayout {
 public:
  std::optional<std::string> GetKeyboardLayoutNameA() override { return {}; }
};

} // namespace quendra::platform::unavailable
