#include "forms/win32/views/TextFieldView.h"

namespace quendra::forms::win32 {

void TextFieldView::HoldEdit(DWORD style, DWORD extendedStyle) {
  Hold(L"EDIT", style, extendedStyle);
  edit_.Take(Inner());
}

void TextFieldView::ControlGone() {
  edit_.Release();
  FieldView::ControlGone();
}

std::optional<LRESULT> TextFieldView::AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) {
  if (const auto answer = FieldView::AnswerInner(message, wParam, lParam)) return answer;
  return edit_.Answer(message, wParam, lParam);
}

void TextFieldView::Notified(int code) {
  if (code == EN_CHANGE) edit_.Edited();
}

void TextFieldView::FocusCame() {
  Context().dispatcher.Dispatch([this] {
    if (edit_.Entry()) edit_.Entry()->GotFocus();
  });
}

void TextFieldView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Font)) GiveLetters();
  if (Concerns(aspect, Aspect::Look)) Inner().Send(EM_SETREADONLY, Box().ReadOnly());
  if (Concerns(aspect, Aspect::Entry)) edit_.ShowText();
  if (aspect == Aspect::Caret) edit_.ShowCaret();
}

HFONT TextFieldView::Letters() const {
  const HFONT letters = FieldView::Letters();
  return Box().Monospaced() ? fixed_.As(letters) : letters;
}

} // namespace quendra::forms::win32
