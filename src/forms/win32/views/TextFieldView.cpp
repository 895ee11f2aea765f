#include "forms/win32/views/TextFieldView.h"

#include "forms/view/VisibleText.h"

#include <utility>

namespace quendra::forms::win32 {

TextFieldView::TextFieldView(ViewContext& context, TextBox& box, HWND parent)
    : FieldView(context, box, parent),
      edit_(*this, box, box.MultiLine, [this](Direction direction) { ReadFrom(direction); }),
      reading_(DirectionOf(box.Value())), held_(reading_) {}

void TextFieldView::HoldEdit(DWORD style, DWORD extendedStyle) {
  style_ = style;
  extendedStyle_ = extendedStyle;
  held_ = reading_;
  const DWORD side = held_ == Direction::RightToLeft ? WS_EX_RTLREADING | WS_EX_RIGHT : 0;
  edit_.Leave();
  Hold(L"EDIT", style, extendedStyle | side);
  edit_.Take(Inner());
}

void TextFieldView::ReadFrom(Direction direction) {
  if (std::exchange(reading_, direction) != direction) TurnSoon();
}

void TextFieldView::Turn() {
  if (reading_ == held_) return;
  HoldEdit(style_, extendedStyle_);
  ::EnableWindow(Inner().Window(), IsEnabled());
  Apply(Aspect::All);
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
  if (Concerns(aspect, Aspect::Entry) || aspect == Aspect::Look) edit_.ShowText();
  if (aspect == Aspect::Caret) edit_.ShowCaret();
}

HFONT TextFieldView::Letters() const {
  const HFONT letters = FieldView::Letters();
  return Box().Monospaced() ? fixed_.As(letters) : letters;
}

} // namespace quendra::forms::win32
