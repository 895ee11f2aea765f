#include "forms/qt/views/TextLineView.h"

namespace quendra::forms::qt {

TextLineView::TextLineView(ViewContext& context, TextBox& box, QWidget* parent)
    : QLineEdit(parent), WidgetView(context, box, *this) {
  connect(this, &QLineEdit::textEdited, this, [this](const QString& text) {
    Context().dispatcher.Dispatch([&] {
      if (TheControl()) Box().Edited(ToText(text), cursorPosition());
    });
  });
}

void TextLineView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Entry)) setText(ShownText(Box().Value()));
  if (Concerns(aspect, Aspect::Look)) setReadOnly(Box().ReadOnly());
}

} // namespace quendra::forms::qt
