#include "forms/qt/views/TextAreaView.h"

namespace quendra::forms::qt {

TextAreaView::TextAreaView(ViewContext& context, TextBox& box, QWidget* parent)
    : QPlainTextEdit(parent), WidgetView(context, box, *this) {}

void TextAreaView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Entry)) setPlainText(ShownText(Box().Value(), LineBreaks::Keep));
  if (Concerns(aspect, Aspect::Look)) setReadOnly(Box().ReadOnly());
}

} // namespace quendra::forms::qt
