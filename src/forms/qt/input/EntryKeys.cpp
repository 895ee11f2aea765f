#include "forms/qt/input/EntryKeys.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/qt/input/KeyEvents.h"
#include "forms/view/fields/FieldText.h"

#include <QFocusEvent>
#include <QKeyEvent>

namespace quendra::forms::qt {

namespace {

/// Whether the focus moves with a window, a menu or a list that drops down.
bool IsOfWindow(const QFocusEvent& event) {
  return event.reason() == Qt::ActiveWindowFocusReason || event.reason() == Qt::PopupFocusReason ||
         event.reason() == Qt::MenuBarFocusReason;
}

/// Named keys that the display server gives a control character, which is not what they type.
bool TypesNothing(const QKeyEvent& event) {
  return event.text().isEmpty() || event.key() == Qt::Key_Delete || event.key() == Qt::Key_Backtab;
}

} // namespace

bool EntryKeys::Press(QKeyEvent& event) {
  if (!entry_ || TypesNothing(event)) return false;
  const KeyPress key = PressOf(event);
  if (!IsTyped(control_->OwnerForm(), key)) {
    event.ignore();
    return true;
  }
  const QList<uint> characters = event.text().toUcs4();
  for (const uint character : characters) {
    const Typing typing = TypeOne(static_cast<int>(character));
    if (!entry_) return true;
    const bool byItself = typing.act == Typing::Act::Command || (key.shift & kCtrl && characters.size() == 1);
    if (byItself && typing.act != Typing::Act::Nothing && character != kEnterKey) return false;
    Apply(typing);
  }
  return true;
}

QString EntryKeys::Commit(const QString& text) {
  QString kept;
  for (const uint character : text.toUcs4()) {
    const Typing typing = TypeOne(static_cast<int>(character));
    if (typing.act == Typing::Act::Insert) kept += ToQString(typing.text);
  }
  return kept;
}

Typing EntryKeys::TypeOne(int character) {
  Typing typing;
  dispatcher_.Dispatch([&] {
    if (entry_) typing = Type(*entry_, character, editing_.ofManyLines);
  });
  return typing;
}

void EntryKeys::Apply(const Typing& typing) {
  if (typing.act == Typing::Act::DeleteBack) editing_.deleteBack();
  if (typing.act == Typing::Act::Insert) editing_.insert(ToQString(Replaced(typing.text, u"\r\n", u"\n")));
}

void EntryKeys::FocusCame(const QFocusEvent& event) {
  const bool comesBack = wentWithWindow_ && IsOfWindow(event);
  wentWithWindow_ = false;
  if (comesBack) return;
  dispatcher_.Dispatch([this] {
    if (entry_) entry_->GotFocus();
  });
}

void EntryKeys::FocusWent(const QFocusEvent& event) { wentWithWindow_ = IsOfWindow(event); }

void EntryKeys::Edited(const QString& shown, int caret) {
  dispatcher_.Dispatch([&] {
    if (!entry_) return;
    const Text value = FieldText::ValueOf(ToText(shown), editing_.ofManyLines);
    entry_->Edited(value, FieldText(value, editing_.ofManyLines).ValuePlace(caret));
  });
}

void EntryKeys::Selected(int start, int length) {
  if (!entry_) return;
  const FieldText text(entry_->Value(), editing_.ofManyLines);
  const int from = text.ValuePlace(start);
  entry_->Selected(from, text.ValuePlace(start + length) - from);
}

} // namespace quendra::forms::qt
