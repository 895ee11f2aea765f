#include "forms/qt/views/TextAreaView.h"

#include "forms/qt/drawing/FieldPainting.h"
#include "forms/qt/input/MouseEvents.h"
#include "forms/view/VisibleText.h"
#include "forms/view/fields/FieldText.h"

#include <QContextMenuEvent>
#include <QInputMethodEvent>
#include <QMenu>
#include <QTextDocument>

#include <memory>
#include <utility>

namespace quendra::forms::qt {

namespace {
constexpr int kAreaEdge = 3;
}

TextAreaView::TextAreaView(ViewContext& context, TextBox& box, QWidget* parent)
    : QPlainTextEdit(parent), WidgetView(context, box, *this),
      keys_(context.dispatcher, box, box,
            {true, [this](const QString& text) { insertPlainText(text); },
             [this] { textCursor().deletePreviousChar(); }}) {
  // Never drawn: the room of the field's edge and ring, inside of which the scroll bar stands.
  setFrameStyle(QFrame::Box | QFrame::Plain);
  setLineWidth(kAreaEdge);
  setTabChangesFocus(true);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setViewportMargins(2, 0, 2, 0);
  BareField(*viewport());
  viewport()->setAutoFillBackground(false);
  QTextOption reading = document()->defaultTextOption();
  reading.setTextDirection(Qt::LayoutDirectionAuto);
  document()->setDefaultTextOption(reading);
  Context().mouse.Watch(*viewport(), *this);
  connect(this, &QPlainTextEdit::textChanged, this, [this] {
    AlignLines();
    if (!showing_) keys_.Edited(toPlainText(), textCursor().position());
  });
  connect(this, &QPlainTextEdit::cursorPositionChanged, this, [this] { TellSelection(); });
  connect(this, &QPlainTextEdit::selectionChanged, this, [this] { TellSelection(); });
}

void TextAreaView::ControlGone() {
  WidgetView::ControlGone();
  keys_.Release();
}

void TextAreaView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Font)) SetLetters();
  if (Concerns(aspect, Aspect::Look)) {
    setReadOnly(Box().ReadOnly());
    // With the keyboard too, to scroll, select and copy.
    if (Box().ReadOnly()) setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setVerticalScrollBarPolicy(Box().VerticalScrollBar() ? Qt::ScrollBarAlwaysOn : Qt::ScrollBarAlwaysOff);
  }
  if (Concerns(aspect, Aspect::Entry)) ShowText();
  if (aspect == Aspect::Caret) ShowCaret();
}

void TextAreaView::SetLetters() {
  if (Box().Monospaced()) setFont(Monospaced(font()));
  setTabStopDistance(kLettersOfTab * fontMetrics().horizontalAdvance(u'0'));
}

// Each line reads by its own first letter; on which side all begin is decided by the first of them. A changed
// option lays the text out again, which tells of a change too.
void TextAreaView::AlignLines() {
  QTextOption reading = document()->defaultTextOption();
  const bool fromRight = DirectionOf(ToText(toPlainText())) == Direction::RightToLeft;
  const Qt::Alignment side = fromRight ? Qt::AlignRight : Qt::AlignLeft;
  if (reading.alignment() == side) return;
  reading.setAlignment(side);
  document()->setDefaultTextOption(reading);
}

void TextAreaView::ShowText() {
  const QString shown = ToQString(FieldText(Box().Value(), true).Shown());
  const bool before = std::exchange(showing_, true);
  if (toPlainText() != shown) setPlainText(shown);
  showing_ = before;
  ShowCaret();
}

void TextAreaView::ShowCaret() {
  const FieldText text(Box().Value(), true);
  const bool before = std::exchange(showing_, true);
  QTextCursor caret = textCursor();
  caret.setPosition(text.ShownPlace(Box().SelStart()));
  caret.setPosition(text.ShownPlace(Box().SelStart() + Box().SelLength()), QTextCursor::KeepAnchor);
  setTextCursor(caret);
  ensureCursorVisible();
  showing_ = before;
}

void TextAreaView::TellSelection() {
  const QTextCursor caret = textCursor();
  if (!showing_) keys_.Selected(caret.selectionStart(), caret.selectionEnd() - caret.selectionStart());
}

bool TextAreaView::event(QEvent* event) {
  if (event->type() == QEvent::Show && TheControl()) TellName();
  if (event->type() == QEvent::Paint) {
    PaintField(*this, StateOfField(*this, isReadOnly()));
    return true;
  }
  return QPlainTextEdit::event(event);
}

void TextAreaView::keyPressEvent(QKeyEvent* event) {
  if (!keys_.Press(*event)) QPlainTextEdit::keyPressEvent(event);
}

void TextAreaView::inputMethodEvent(QInputMethodEvent* event) {
  if (!event->commitString().isEmpty())
    event->setCommitString(keys_.Commit(event->commitString()), event->replacementStart(),
                           event->replacementLength());
  QPlainTextEdit::inputMethodEvent(event);
}

void TextAreaView::focusInEvent(QFocusEvent* event) {
  QPlainTextEdit::focusInEvent(event);
  update();
  keys_.FocusCame(*event);
}

void TextAreaView::focusOutEvent(QFocusEvent* event) {
  QPlainTextEdit::focusOutEvent(event);
  update();
  keys_.FocusWent(*event);
}

void TextAreaView::contextMenuEvent(QContextMenuEvent* event) {
  const std::unique_ptr<QMenu> menu(createStandardContextMenu());
  CaptionEditMenu(*menu);
  menu->exec(event->globalPos());
}

} // namespace quendra::forms::qt
