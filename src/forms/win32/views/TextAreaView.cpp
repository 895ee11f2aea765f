#include "forms/win32/views/TextAreaView.h"

namespace quendra::forms::win32 {

namespace {
/// The room of the field's edge and ring, inside of which the scroll bar stands.
constexpr int kAreaEdge = 3;
/// Pixels between it and the text.
constexpr int kMargin = 6;
} // namespace

TextAreaView::TextAreaView(ViewContext& context, TextBox& box, HWND parent)
    : TextFieldView(context, box, parent) {
  HoldEdit(ES_MULTILINE | ES_AUTOVSCROLL | ES_WANTRETURN | (box.VerticalScrollBar() ? WS_VSCROLL : 0),
           BarSide());
}

void TextAreaView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Look) && Inner().SetStyle(GWL_STYLE, WS_VSCROLL, Box().VerticalScrollBar()))
    ::SetWindowPos(Inner().Window(), nullptr, 0, 0, 0, 0,
                   SWP_NOMOVE | SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE | SWP_FRAMECHANGED);
  TextFieldView::Apply(aspect);
  // A change of letters takes the margins back.
  if (Concerns(aspect, Aspect::Font))
    Inner().Send(EM_SETMARGINS, EC_LEFTMARGIN | EC_RIGHTMARGIN, MAKELPARAM(kMargin, kMargin));
}

Area TextAreaView::Room(Extent field) const { return Area{{}, field}.GrownBy(-kAreaEdge); }

} // namespace quendra::forms::win32
