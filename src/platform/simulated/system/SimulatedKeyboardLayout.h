#pragma once

#include "platform/system/KeyboardLayout.h"

namespace quendra::platform::simulated {

/// The user types English unless the test says otherwise.
class SimulatedKeyboardLayout : public KeyboardLayout {
 public:
  std::optional<std::string> Name = "00000409";

  std::optional<std::string> GetKeyboardLayoutNameA() override { return Name; }
};

} // namespace quendra::platform::simulated
