#include "forms/view/MouseRules.h"

#include <utility>

namespace quendra::forms {

MouseRules::Meaning MouseRules::Pressed(const Control& control, int button) {
  if (button == kLeftButton) pressed_ = &control;
  return Meaning::Press;
}

MouseRules::Meaning MouseRules::PressedAgain(const Control& control, int button) {
  if (!control.DoubleClick || button != kLeftButton) return Pressed(control, button);
  return Meaning::DoubleClick;
}

MouseRules::Meaning MouseRules::Released(const Control& control, int button, bool inside) {
  if (button != kLeftButton) return Meaning::Nothing;
  const bool wasPressed = std::exchange(pressed_, nullptr) == &control;
  return wasPressed && inside ? Meaning::Click : Meaning::Nothing;
}

void MouseRules::Forget(const Control& control) {
  if (pressed_ == &control) pressed_ = nullptr;
}

} // namespace quendra::forms
