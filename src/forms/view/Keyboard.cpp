#include "forms/view/Keyboard.h"

#include <algorithm>

namespace quendra::forms {

std::vector<Control*> TabOrder(const Form& form) {
  std::vector<Control*> controls = ControlsIn(form);
  std::stable_sort(controls.begin(), controls.end(), [](const Control* left, const Control* right) {
    return left->TabIndex < right->TabIndex;
  });
  return controls;
}

Control* FirstFocus(const Form& form) {
  for (Control* control : TabOrder(form))
    if (control->TakesFocus() && control->IsUsable()) return control;
  return nullptr;
}

Control* ControlPressedBy(const Form& form, int keyCode, int shift) {
  if (shift != kNoShift) return nullptr;
  Control* const control = keyCode == kEnterKey    ? form.Default
                           : keyCode == kEscapeKey ? form.Cancel
                                                   : nullptr;
  return control && control->IsUsable() ? control : nullptr;
}

} // namespace quendra::forms
