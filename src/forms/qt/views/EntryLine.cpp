#include "forms/qt/views/EntryLine.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/qt/drawing/FieldPainting.h"
#include "forms/view/fields/FieldText.h"

#include <QContextMenuEvent>
#include <QInputMethodEvent>
#include <QMenu>

#include <memory>
#include <utility>

namespace quendra::forms::qt {

EntryLine::EntryLine(Dispatcher& dispatcher, const Control& control, TextEntry& entry, QWidget* parent)
    : QLineEdit(parent),
      keys_(dispatcher, control, entry,
            {false, [this](const QString& text) { insert(text); }, [this] { backspace(); }}) {
  connect(this, &QLineEdit::textEdited, this, [this](const QString& text) {
    setLayoutDirection(ToQt(DirectionOf(ToText(text))));
    keys_.Edited(text, cursorPosition());
  });
  connect(this, &QLineEdit::selectionChanged, this, [this] { TellSelection(); });
  connect(this, &QLineEdit::cursorPositionChanged, this, [this] { TellSelection(); });
}

void EntryLine::TellSelection() {
  if (showing_) return;
  keys_.Selected(hasSelectedText() ? selectionStart() : cursorPosition(), selectionLength());
}

void EntryLine::ShowText() {
  const QString shown = ToQString(FieldText(keys_.Entry()->Value(), false).Shown());
  const bool before = std::exchange(showing_, true);
  if (text() != shown) setText(shown);
  // The caret of an empty field stands where Latin letters, which all fields here are for, begin.
  setLayoutDirection(ToQt(DirectionOf(keys_.Entry()->Value())));
  showing_ = before;
  ShowCaret();
}

void EntryLine::ShowCaret() {
  const bool before = std::exchange(showing_, true);
  const TextEntry& entry = *keys_.Entry();
  if (entry.SelLength() > 0)
    setSelection(entry.SelStart(), entry.SelLength());
  else
    setCursorPosition(entry.SelStart());
  showing_ = before;
}

void EntryLine::keyPressEvent(QKeyEvent* event) {
  if (!keys_.Press(*event)) QLineEdit::keyPressEvent(event);
}

void EntryLine::inputMethodEvent(QInputMethodEvent* event) {
  if (!event->commitString().isEmpty())
    event->setCommitString(keys_.Commit(event->commitString()), event->replacementStart(),
                           event->replacementLength());
  QLineEdit::inputMethodEvent(event);
}

// Where the line is a part of another field, that one draws the ring.
void EntryLine::focusInEvent(QFocusEvent* event) {
  QLineEdit::focusInEvent(event);
  parentWidget()->update();
  keys_.FocusCame(*event);
}

void EntryLine::focusOutEvent(QFocusEvent* event) {
  QLineEdit::focusOutEvent(event);
  parentWidget()->update();
  keys_.FocusWent(*event);
}

void EntryLine::contextMenuEvent(QContextMenuEvent* event) {
  const std::unique_ptr<QMenu> menu(createStandardContextMenu());
  CaptionEditMenu(*menu);
  menu->exec(event->globalPos());
}

} // namespace quendra::forms::qt
