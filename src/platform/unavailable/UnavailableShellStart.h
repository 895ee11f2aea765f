#pragma once

#include "platform/system/ShellStart.h"

namespace quendra::platform::unavailable {

/// A system that starts nothing.
class UnavailableShellStart : public ShellStart {
 public:
  bool Shell(const std::string&, int) override { return false; }
};

} // namespace quendra::platform::unavailable
