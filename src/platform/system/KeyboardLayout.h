#pragma once

#include <optional>
#include <string>

namespace quendra::platform {

/// The keyboard layout with which the user types now.
class KeyboardLayout {
 public:
  virtual ~KeyboardLayout() = default;

  /// The layout's name as the system writes it, a language's number in eight hexadecimal digits ("0000040D"
  /// is Hebrew); nothing where it can't be told.
  virtual std::optional<std::string> GetKeyboardLayoutNameA() = 0;
};

} // namespace quendra::platform
