#include "forms/win32/views/FieldView.h"

#include "forms/view/Accessible.h"
#include "forms/view/Palette.h"

#include <utility>

namespace quendra::forms::win32 {

namespace {
constexpr UINT kTurn = WM_APP + 0x212;
}

FieldView::FieldView(ViewContext& context, Control& control, HWND parent) : WindowView(context, control) {
  Create(parent);
}

void FieldView::Hold(const wchar_t* windowClass, DWORD style, DWORD extendedStyle) {
  if (!name_) name_ = MakeName(Window());
  InnerWindow::Replace(
      inner_, std::make_unique<InnerWindow>(*this, InnerWindow::Kind{windowClass, style, extendedStyle},
                                            [this](UINT message, WPARAM wParam, LPARAM lParam) {
                                              return AnswerInner(message, wParam, lParam);
                                            }));
}

std::unique_ptr<InnerWindow> FieldView::MakeName(HWND parent) {
  const auto leave = [](UINT, WPARAM, LPARAM) -> std::optional<LRESULT> { return std::nullopt; };
  return std::make_unique<InnerWindow>(*this, InnerWindow::Kind{L"STATIC", 0, 0, parent}, leave);
}

void FieldView::GiveName(const InnerWindow& name) const {
  ::SetWindowTextW(name.Window(), winapi::Wide(AccessibleOf(*TheControl()).name));
}

void FieldView::TurnSoon() { ::PostMessageW(Window(), kTurn, 0, 0); }

// The window that is to be replaced may be waiting for a handler, which handles messages.
void FieldView::TurnOrWait() {
  turnWaits_ = !IsAlone();
  if (!turnWaits_ && TheControl()) Turn();
}

void FieldView::Rested() {
  if (std::exchange(turnWaits_, false)) TurnSoon();
}

FieldState FieldView::State() const { return {IsEnabled(), IsReadOnly(), HasFocus(), UsesKeys()}; }

void FieldView::Paint(Drawing& drawing) {
  const Area whole{{0, 0}, WindowPlace().extent};
  const FieldState state = State();
  const FieldFace face = FaceOf(state);
  drawing.RoundRect(whole, face.corner, face.fill, face.border);
  drawing.Rings(whole, RingsOf(state));
}

std::optional<LRESULT> FieldView::Answer(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!inner_) return std::nullopt; // while it is made
  switch (message) {
  case WM_SETFOCUS:
    // A handler may have moved it on.
    if (::GetFocus() == Window()) ::SetFocus(KeyWindow());
    return 0;
  case kTurn: TurnOrWait(); return 0;
  case WM_SIZE: Arrange(); return std::nullopt;
  case WM_ENABLE: ::EnableWindow(inner_->Window(), wParam != 0); return std::nullopt;
  case WM_COMMAND:
    if (reinterpret_cast<HWND>(lParam) != inner_->Window()) return std::nullopt;
    Notified(HIWORD(wParam));
    return 0;
  case WM_CTLCOLOREDIT:
  case WM_CTLCOLORSTATIC:
  case WM_CTLCOLORLISTBOX: return ColourText(reinterpret_cast<HDC>(wParam));
  default: return std::nullopt;
  }
}

std::optional<LRESULT> FieldView::AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_KILLFOCUS) Invalidate();
  if (message != WM_SETFOCUS) return std::nullopt;
  const LRESULT answer = inner_->PassOn(message, wParam, lParam);
  FocusCameFrom(reinterpret_cast<HWND>(wParam));
  return answer;
}

void FieldView::FocusCameFrom(HWND before) {
  Invalidate();
  // What came by the view's own window has been told.
  if (TheControl() && Around(before) != this && !Context().state.focusComesBack) FocusCame();
}

LRESULT FieldView::ColourText(HDC device) const {
  const Colour fill = FaceOf(State()).fill;
  ::SetTextColor(device, Palette::Ink);
  ::SetBkColor(device, fill);
  ::SetDCBrushColor(device, fill);
  return reinterpret_cast<LRESULT>(::GetStockObject(DC_BRUSH));
}

void FieldView::TellName() {
  WindowView::TellName();
  if (name_) GiveName(*name_);
}

HFONT FieldView::Letters() const { return Context().fonts.FontOf(TheControl()->TextFont(), Context().scale); }

void FieldView::GiveLetters() {
  inner_->Send(WM_SETFONT, reinterpret_cast<WPARAM>(Letters()), TRUE);
  Arrange();
}

void FieldView::Arrange() {
  if (TheControl()) inner_->MoveTo(Room(WindowPlace().extent));
}

} // namespace quendra::forms::win32
