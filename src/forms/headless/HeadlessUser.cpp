#include "forms/headless/HeadlessDesktop.h"
#include "forms/view/Keyboard.h"

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
  return Act(form, [&] {
    active_ = &form;
    form.Form_Activate();
  });
}

bool HeadlessDesktop::Deactivate(Form& form) {
  return Act(form, [&] {
    if (active_ == &form) active_ = nullptr;
    form.Form_Deactivate();
  });
}

} // namespace quendra::forms::headless
