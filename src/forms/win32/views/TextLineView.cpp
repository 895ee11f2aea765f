#include "forms/win32/views/TextLineView.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {
constexpr char16_t kMask = u'\u25CF';
}

TextLineView::TextLineView(ViewContext& context, TextBox& box, HWND parent)
    : TextFieldView(context, box, parent) {
  HoldEdit(ES_AUTOHSCROLL);
}

void TextLineView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Look)) {
    Inner().Send(EM_SETPASSWORDCHAR, Box().Masked() ? kMask : 0);
    Inner().Redraw();
  }
  TextFieldView::Apply(aspect);
}

// As high as its letters: the window sets them at its top.
Area TextLineView::Room(Extent field) const {
  const int height = std::min(field.height - 2, Context().fonts.LineHeight(Letters()));
  return {{kFieldPadding, (field.height - height) / 2}, {field.width - 2 * kFieldPadding, height}};
}

} // namespace quendra::forms::win32
