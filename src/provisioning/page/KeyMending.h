#pragma once

#include "forms/controls/Controls.h"
#include "foundation/InputNormaliser.h"

namespace quendra::provisioning {

/// What the fields of the page do with a key: it is mended, and the mark beside the field tells of one that
/// is refused.
class KeyMending {
 public:
  explicit KeyMending(platform::KeyboardLayout& layout) : normaliser_(layout) {}

  void Watch(forms::TextEntry& field, forms::Label& mark, std::int16_t specialFlag);

 private:
  void KeyPress(int& keyCode, forms::Label& mark, std::int16_t specialFlag);

  foundation::InputNormaliser normaliser_;
};

} // namespace quendra::provisioning
