#include "forms/headless/HeadlessDesktop.h"
#include "forms/view/FocusOrder.h"
#include "forms/view/fields/Typing.h"

namespace quendra::forms::headless {

namespace {

/// What the key gives, 0 for no character. The codes of named keys are those of some marks: they stand for
/// the keys here.
int CharacterOf(const KeyPress& key) {
  if (key.code == kBackspaceKey || key.code == kEnterKey || key.code == kEscapeKey) return key.code;
  const bool isNamed =
      (key.code >= kPageUpKey && key.code <= kDownKey) || key.code == kInsertKey || key.code == kDeleteKey;
  if (key.code < kSpaceKey || isNamed) return 0;
  return key.shift & kCtrl ? key.code & 0x1F : key.code;
}

void Replace(TextEntry& entry, int start, int length, TextView with) {
  Text text = entry.Value();
  text.replace(static_cast<std::size_t>(start), static_cast<std::size_t>(length), with);
  entry.Edited(std::move(text), start + static_cast<int>(with.size()));
}

void DeleteBack(TextEntry& entry) {
  const int start = entry.SelStart();
  if (entry.SelLength() > 0) return Replace(entry, start, entry.SelLength(), {});
  if (start == 0) return;
  const bool endsLine = TextView(entry.Value()).substr(0, static_cast<std::size_t>(start)).ends_with(u"\r\n");
  const int length = endsLine ? 2 : 1;
  Replace(entry, start - length, length, {});
}

} // namespace

bool HeadlessDesktop::Act(Control& control, const std::function<void()>& action) {
  if (Ended || !control.IsUsable()) return false;
  Dispatch(action);
  return true;
}

bool HeadlessDesktop::Click(Control& control) {
  return Act(control, [&] {
    if (FieldOf(control)) MoveFocus(control.OwnerForm(), &control);
    control.Click();
  });
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
  Control* const focused = Focused(form);
  const bool tabs = keyCode == kTabKey && (shift == kNoShift || shift == kShift);
  const auto* label = dynamic_cast<const Label*>(focused);
  const bool presses = label && PressesLabel(*label, key);
  const int character = CharacterOf(key);
  if (focused && FieldOf(*focused) && character != 0 && IsTyped(form, key))
    return Act(*focused, [&] {
      if (HearsOf(form, key, focused)) form.Form_KeyDown(keyCode, shift);
      TypeInto(*focused, character);
    });
  if (auto* list = dynamic_cast<ListBox*>(focused))
    if (const auto item = ItemReachedBy(*list, key))
      return Act(*list, [&] {
        if (HearsOf(form, key, focused)) form.Form_KeyDown(keyCode, shift);
        if (*item != list->ListIndex()) list->SelectItem(*item);
      });
  if (!tabs && !presses) return KeyDown(form, keyCode, shift);
  return Act(form, [&] {
    if (HearsOf(form, key, focused)) form.Form_KeyDown(keyCode, shift);
    if (presses && label->IsUsable()) label->Click();
    if (presses) return;
    const auto direction = shift == kShift ? TabDirection::Backwards : TabDirection::Forwards;
    MoveFocus(form, NextFocus(form, focused, direction));
  });
}

bool HeadlessDesktop::Type(Control& field, TextView text) {
  if (!FieldOf(field)) return false;
  return Act(field, [&] {
    MoveFocus(field.OwnerForm(), &field);
    for (const char16_t character : text) TypeInto(field, character);
  });
}

void HeadlessDesktop::TypeInto(Control& field, int character) {
  TextEntry* const entry = FieldOf(field);
  const auto* box = dynamic_cast<const TextBox*>(&field);
  const Typing typing = forms::Type(*entry, character, box && box->MultiLine);
  const bool hasGone = !field.OwnerForm().IsLoaded();
  if (hasGone || (box && box->ReadOnly())) return;
  if (typing.act == Typing::Act::Insert) Replace(*entry, entry->SelStart(), entry->SelLength(), typing.text);
  if (typing.act == Typing::Act::DeleteBack) DeleteBack(*entry);
}

bool HeadlessDesktop::CloseBox(Form& form) {
  return Act(form, [&] { Unload(form); });
}

bool HeadlessDesktop::ChooseItem(ComboBox& combo, int index) {
  if (index < 0 || index >= combo.ListCount()) return false;
  return Act(combo, [&] { combo.SelectItem(index); });
}

bool HeadlessDesktop::ChooseItem(ListBox& list, int index) {
  if (index < 0 || index >= list.ListCount()) return false;
  return Act(list, [&] { list.SelectItem(index); });
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
