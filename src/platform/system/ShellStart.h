#pragma once

#include <string>

namespace quendra::platform {

/// Starts programs by command line.
class ShellStart {
 public:
  virtual ~ShellStart() = default;

  static constexpr int kHiddenWindow = 0;
  static constexpr int kNormalWindow = 1;
  static constexpr int kAsItIsShown = 5;
  static constexpr int kMinimizedWithoutFocus = 6;

  /// Doesn't wait. False when nothing could be started.
  virtual bool Shell(const std::string& commandLine, int windowStyle) = 0;
};

} // namespace quendra::platform
