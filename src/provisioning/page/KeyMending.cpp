#include "provisioning/page/KeyMending.h"

namespace quendra::provisioning {

void KeyMending::Watch(forms::TextEntry& field, forms::Label& mark, std::int16_t specialFlag) {
  field.KeyPress = [this, &mark, specialFlag](int& keyCode) { KeyPress(keyCode, mark, specialFlag); };
}

void KeyMending::KeyPress(int& keyCode, forms::Label& mark, std::int16_t specialFlag) {
  mark.Visible = false;
  normaliser_.MendKeyPress(keyCode, specialFlag);
  if (keyCode != 0) return;
  mark.Caption = Text(u"הוקש מקש שגוי");
  mark.Visible = true;
}

} // namespace quendra::provisioning
