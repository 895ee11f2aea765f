#include "forms/view/Keyboard.h"

#include "forms/view/FocusOrder.h"

#include <algorithm>

namespace quendra::forms {

int CodeOfCharacter(char16_t character) {
  return character >= u'a' && character <= u'z' ? character - u'a' + u'A' : character;
}

std::vector<Control*> TabOrder(const Form& form) {
  std::vector<Control*> controls = ControlsIn(form);
  std::stable_sort(controls.begin(), controls.end(), [](const Control* left, const Control* right) {
    return left->TabIndex < right->TabIndex;
  });
  return controls;
}

Control* FirstFocus(const Form& form) { return NextFocus(form, nullptr, TabDirection::Forwards); }

bool HearsOf(const Form& form, const KeyPress& key, bool aControlHasFocus) {
  return key.code != 0 && (form.KeyPreview || !aControlHasFocus);
}

bool PressesLabel(const Label& label, const KeyPress& key) {
  // With Alt they are the window's own.
  return label.IsButton() && !key.repeated && !(key.shift & kAlt) &&
         (key.code == kEnterKey || key.code == kSpaceKey);
}

std::optional<int> ItemReachedBy(const ListBox& list, const KeyPress& key) {
  const int last = list.ListCount() - 1;
  if (last < 0 || key.shift != kNoShift) return std::nullopt;
  switch (key.code) {
  case kUpKey: return std::max(list.ListIndex() - 1, 0);
  case kDownKey: return std::min(list.ListIndex() + 1, last);
  case kHomeKey: return 0;
  case kEndKey: return last;
  default: return std::nullopt;
  }
}

bool PassesList(int shift, bool givesCharacter) { return (shift & (kCtrl | kAlt)) != 0 && givesCharacter; }

Control* ControlPressedBy(const Form& form, int keyCode, int shift) {
  if (shift != kNoShift) return nullptr;
  Control* const control = keyCode == kEnterKey    ? form.Default
                           : keyCode == kEscapeKey ? form.Cancel
                                                   : nullptr;
  return control && control->IsUsable() ? control : nullptr;
}

Control* ControlPressedBy(const Form& form, const KeyPress& key) {
  return key.repeated ? nullptr : ControlPressedBy(form, key.code, key.shift);
}

} // namespace quendra::forms
