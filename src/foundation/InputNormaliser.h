#pragma once

#include <cstdint>

namespace quendra::platform {
class KeyboardLayout;
}

namespace quendra::foundation {

/// Mends what a subscriber types into a field of Latin letters while the Hebrew layout is active.
class InputNormaliser {
 public:
  explicit InputNormaliser(platform::KeyboardLayout& layout) : layout_(layout) {}

  /// Turns a key press into the character that the same key gives on the Latin layout, as a small letter;
  /// `result` is 0 for a key that has no place in a user name. A key code is its character's number in
  /// Unicode. With the special flag 0 the codes of some marks are cleared, which changes no result.
  void NormaliseKey(std::int16_t& keyCode, std::int16_t& specialFlag, std::int16_t& result);
  /// Turns the key press of a field into what is typed there, 0 for a key that is refused. Characters beyond
  /// 16 bits with a sign are.
  void MendKeyPress(int& keyCode, std::int16_t specialFlag);

 private:
  std::int16_t OfHebrewLayout(char16_t onHebrewLayout);

  platform::KeyboardLayout& layout_;
};

} // namespace quendra::foundation
