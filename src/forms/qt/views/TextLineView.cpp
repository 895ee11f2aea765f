#include "forms/qt/views/TextLineView.h"

#include "forms/qt/drawing/FieldPainting.h"

#include <QEvent>

namespace quendra::forms::qt {

TextLineView::TextLineView(ViewContext& context, TextBox& box, QWidget* parent)
    : EntryLine(context.dispatcher, box, box, parent), WidgetView(context, box, *this) {
  setFrame(false);
  setTextMargins(kFieldPadding, 0, kFieldPadding, 0);
  BareField(*this);
}

void TextLineView::ControlGone() {
  WidgetView::ControlGone();
  Forget();
}

void TextLineView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Font) && Box().Monospaced()) setFont(Monospaced(font()));
  if (Concerns(aspect, Aspect::Look)) {
    setReadOnly(Box().ReadOnly());
    setEchoMode(Box().Masked() ? QLineEdit::Password : QLineEdit::Normal);
  }
  if (Concerns(aspect, Aspect::Entry)) ShowText();
  if (aspect == Aspect::Caret) ShowCaret();
}

bool TextLineView::event(QEvent* event) {
  // A plain member, as with labels: what was set after the view came counts from the first showing on.
  if (event->type() == QEvent::Show && TheControl()) TellName();
  return EntryLine::event(event);
}

void TextLineView::paintEvent(QPaintEvent* event) {
  PaintField(*this, StateOfField(*this, isReadOnly()));
  EntryLine::paintEvent(event);
}

} // namespace quendra::forms::qt
