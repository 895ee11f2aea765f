#include "forms/headless/HeadlessDesktop.h"
#include "forms/view/FocusOrder.h"

namespace quendra::forms::headless {

bool HeadlessDesktop::Act(Control& control, const std::function<void()>& action) {
  if (Ended || !control.IsUsable()) return false;
  Dispatch(action);
  return true;
}

bool HeadlessDesktop::Click(Control& control) {
  return Act(control, [&] { control.Click(); });
}

bool HeadlessDesktop::DoubleClick(Control& control) {
  return Act(control, [&] { control.DoubleClick(); });
}

bool HeadlessDesktop::MouseMove(Control& control, int button, int shift, int x, int y) {
  return Act(control, [&] { control.MouseMove(button, shift, x, y); });
}

bool HeadlessDesktop::MouseDown(Control& control, int button, int shift, int x, int y) {
  return Act(control, [&] { control.MouseDown(button, shift, x, y); });
}

bool HeadlessDesktop::KeyDown(Form& form, int keyCode, int shift) {
  if (!form.KeyPreview && !ControlPressedBy(form, keyCode, shift)) return false;
  return Act(form, [&] {
    if (form.KeyPreview) form.Form_KeyDown(keyCode, shift);
    if (const Control* pressed = ControlPressedBy(form, keyCode, shift)) pressed->Click();
  });
}

bool HeadlessDesktop::PressKey(Form& form, int keyCode, int shift) {
  const KeyPress key{keyCode, shift};
  const Control* focused = Focused(form);
  const bool tabs = keyCode == kTabKey && (shift == kNoShift || shift == kShift);
  const auto* label = dynamic_cast<const Label*>(focused);
  const bool presses = label && PressesLabel(*label, key);
  if (!tabs && !presses) return KeyDown(form, keyCode, shift);
  return Act(form, [&] {
    if (HearsOf(form, key, focused)) form.Form_KeyDown(keyCode, shift);
    if (presses && label->IsUsable()) label->Click();
    if (presses) return;
    const auto direction = shift == kShift ? TabDirection::Backwards : TabDirection::Forwards;
    MoveFocus(form, NextFocus(form, focused, direction));
  });
}

bool HeadlessDesktop::CloseBox(Form& form) {
  return Act(form, [&] { Unload(form); });
}

bool HeadlessDesktop::ChooseItem(ComboBox& combo, int index) {
  if (index < 0 || index >= combo.ListCount()) return false;
  return Act(combo, [&] { combo.SelectItem(index); });
}

bool HeadlessDesktop::ClickHeader(ListView& list, int header) {
  if (header < 1 || header > static_cast<int>(list.Columns().size())) return false;
  return Act(list, [&] { list.ColumnClick(header); });
}

bool HeadlessDesktop::ClickRow(ListView& list, int row) {
  if (row < 1 || row > list.Count()) return false;
  return Act(list, [&] {
    list.Select(&list.Row(row));
    list.Click();
  });
}

bool HeadlessDesktop::Activate(Form& form) {
  return Act(form, [&] { active_.Activate(form); });
}

bool HeadlessDesktop::Deactivate(Form& form) {
  return Act(form, [&] { active_.Deactivate(form); });
}

} // namespace quendra::forms::headless
