#include "forms/win32/views/ComboBoxView.h"

#include "forms/view/ListLook.h"
#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"
#include "forms/win32/input/MouseInput.h"
#include "forms/win32/views/ItemPainting.h"

#include <utility>

namespace quendra::forms::win32 {

namespace {

/// The room of the field's edge and ring.
constexpr int kComboEdge = 3;
constexpr int kArrowRoom = 18;
constexpr int kRoomRoundLetters = 4;
constexpr int kMostRows = 10;
constexpr UINT kChosen = WM_APP + 0x211;

DWORD StyleOf() {
  return CBS_DROPDOWNLIST | CBS_HASSTRINGS | CBS_OWNERDRAWFIXED | CBS_NOINTEGRALHEIGHT | WS_VSCROLL |
         WS_CLIPCHILDREN;
}

} // namespace

ComboBoxView::ComboBoxView(ViewContext& context, ComboBox& combo, HWND parent)
    : FieldView(context, combo, parent), reading_(DirectionOf(combo.Value())), held_(reading_) {
  Hold(L"COMBOBOX", StyleOf(), BarSide());
  if (!combo.FreeText) return;
  field_.emplace(*this, combo, false, [this](Direction direction) { ReadFrom(direction); });
  MakeEdit();
}

void ComboBoxView::MakeEdit() {
  held_ = reading_;
  const DWORD side = held_ == Direction::RightToLeft ? WS_EX_RTLREADING | WS_EX_RIGHT : 0;
  field_->Leave();
  if (!editName_) editName_ = MakeName(Inner().Window());
  InnerWindow::Replace(edit_, std::make_unique<InnerWindow>(
                                  *this, InnerWindow::Kind{L"EDIT", ES_AUTOHSCROLL, side, Inner().Window()},
                                  [this](UINT message, WPARAM wParam, LPARAM lParam) {
                                    return AnswerEdit(message, wParam, lParam);
                                  }));
  field_->Take(*edit_);
}

void ComboBoxView::ReadFrom(Direction direction) {
  if (std::exchange(reading_, direction) != direction) TurnSoon();
}

void ComboBoxView::Turn() {
  if (reading_ == held_) return;
  MakeEdit();
  ::EnableWindow(edit_->Window(), IsEnabled());
  edit_->Send(WM_SETFONT, reinterpret_cast<WPARAM>(Letters()));
  PlaceEdit();
  field_->ShowText();
}

void ComboBoxView::ControlGone() {
  if (field_) field_->Release();
  FieldView::ControlGone();
}

void ComboBoxView::TellName() {
  FieldView::TellName();
  if (editName_) GiveName(*editName_);
}

HWND ComboBoxView::KeyWindow() const { return edit_ ? edit_->Window() : FieldView::KeyWindow(); }

void ComboBoxView::FocusCame() {
  Context().dispatcher.Dispatch([this] {
    if (field_ && field_->Entry()) field_->Entry()->GotFocus();
  });
}

int ComboBoxView::RowHeight() const {
  return Context().fonts.LineHeight(Letters()) + Context().scale.Pixels(kRoomRoundLetters);
}

void ComboBoxView::Apply(Aspect aspect) {
  const bool before = std::exchange(showing_, true);
  if (Concerns(aspect, Aspect::Font)) {
    GiveLetters();
    if (edit_) edit_->Send(WM_SETFONT, reinterpret_cast<WPARAM>(Letters()));
    Inner().Send(CB_SETITEMHEIGHT, 0, RowHeight());
    Arrange();
  }
  if (Concerns(aspect, Aspect::Items)) FillItems();
  if (Concerns(aspect, Aspect::Items) || aspect == Aspect::Selection) ShowSelection();
  if (field_ && aspect == Aspect::Entry) field_->ShowText();
  if (field_ && aspect == Aspect::Caret) field_->ShowCaret();
  showing_ = before;
}

void ComboBoxView::FillItems() const {
  // Items only grow until they are cleared, so the ones that stand here already are right.
  int there = static_cast<int>(Inner().Send(CB_GETCOUNT));
  if (there > Combo().ListCount() || Combo().ListCount() == 0) {
    Inner().Send(CB_RESETCONTENT);
    there = 0;
  }
  for (int i = there; i < Combo().ListCount(); ++i) {
    const Text shown = VisibleText(Combo().List(i));
    Inner().Send(CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(winapi::Wide(shown)));
  }
}

void ComboBoxView::ShowSelection() {
  const bool before = std::exchange(showing_, true);
  if (static_cast<int>(Inner().Send(CB_GETCURSEL)) != Combo().ListIndex())
    Inner().Send(CB_SETCURSEL, static_cast<WPARAM>(Combo().ListIndex()));
  if (field_) field_->ShowText();
  Inner().Redraw();
  showing_ = before;
}

Area ComboBoxView::Room(Extent field) const { return Area{{}, field}.GrownBy(-kComboEdge); }

// The system counts the list that hangs down into the height, and takes the height of what is closed from
// that of its letters.
void ComboBoxView::Arrange() {
  if (!TheControl()) return;
  Area room = Room(WindowPlace().extent);
  const int wanted = room.extent.height;
  room.extent.height += kMostRows * RowHeight();
  Inner().MoveTo(room);
  const auto closed = [this] {
    RECT place{};
    ::GetWindowRect(Inner().Window(), &place);
    return static_cast<int>(place.bottom - place.top);
  };
  // What it puts round the letters is not the same before and after they are told.
  LRESULT letters = Inner().Send(CB_GETITEMHEIGHT, static_cast<WPARAM>(-1));
  for (int tries = 0; tries < 2 && closed() != wanted; ++tries) {
    letters += wanted - closed();
    Inner().Send(CB_SETITEMHEIGHT, static_cast<WPARAM>(-1), letters);
  }
  PlaceEdit();
}

Area ComboBoxView::TextRoom(Extent inside) const {
  constexpr int kAside = kFieldPadding - kComboEdge;
  const bool fromRight = ReadingDirection() == Direction::RightToLeft;
  return {{fromRight ? kArrowRoom : kAside, 0}, {inside.width - kArrowRoom - kAside, inside.height}};
}

void ComboBoxView::PlaceEdit() const {
  if (!edit_) return;
  const Area room = TextRoom(Inner().Inside());
  const int height = std::min(room.extent.height, Context().fonts.LineHeight(Letters()));
  edit_->MoveTo({{room.corner.left, (room.extent.height - height) / 2}, {room.extent.width, height}});
}

std::optional<LRESULT> ComboBoxView::Answer(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!TheControl()) return FieldView::Answer(message, wParam, lParam);
  if (message == WM_MEASUREITEM) {
    reinterpret_cast<MEASUREITEMSTRUCT*>(lParam)->itemHeight = static_cast<UINT>(RowHeight());
    return TRUE;
  }
  if (message != WM_DRAWITEM) return FieldView::Answer(message, wParam, lParam);
  const auto& due = *reinterpret_cast<const DRAWITEMSTRUCT*>(lParam);
  const auto item = static_cast<int>(due.itemID);
  if (due.itemState & ODS_COMBOBOXEDIT) {
    Inner().Redraw();
    return TRUE;
  }
  if (item < 0 || item >= Combo().ListCount()) return TRUE;
  const Colour ground = (due.itemState & ODS_SELECTED) != 0 ? RowGround(0, true) : Palette::Page;
  PaintItem(due, {VisibleText(Combo().List(item)), Letters(), ground, ReadingDirection()});
  return TRUE;
}

std::optional<LRESULT> ComboBoxView::AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!TheControl()) return std::nullopt;
  switch (message) {
  case WM_ERASEBKGND: return 1;
  case WM_PAINT: PaintClosed(); return 0;
  case kChosen: return TellChoice();
  case WM_COMMAND:
    if (!edit_ || reinterpret_cast<HWND>(lParam) != edit_->Window()) return std::nullopt;
    if (HIWORD(wParam) == EN_CHANGE) field_->Edited();
    return 0;
  case WM_ENABLE:
    if (edit_) ::EnableWindow(edit_->Window(), wParam != 0);
    return std::nullopt;
  case WM_LBUTTONDOWN:
  case WM_LBUTTONDBLCLK: return PressClosed(message, wParam, lParam);
  // Turning the wheel over a closed list would switch what it stands for by accident.
  case WM_MOUSEWHEEL:
    if (!IsDropped()) return ::DefWindowProcW(Inner().Window(), message, wParam, lParam);
    return std::nullopt;
  case WM_CTLCOLOREDIT:
  case WM_CTLCOLORSTATIC:
  case WM_CTLCOLORLISTBOX: return Answer(message, wParam, lParam);
  case WM_SIZE:
    Inner().PassOn(message, wParam, lParam);
    PlaceEdit();
    return 0;
  default: return FieldView::AnswerInner(message, wParam, lParam);
  }
}

// The class lets the list hang down and follows the mouse into it, until the button is let go over an item.
LRESULT ComboBoxView::PressClosed(UINT message, WPARAM wParam, LPARAM lParam) {
  // A click is what chooses an item, not what opens the list.
  Context().mouse.ReleaseCapture();
  return Inner().PassOn(message, wParam, lParam);
}

void ComboBoxView::Drop() {
  const bool drops = !IsDropped();
  // What hangs down has the keys.
  ::SetFocus(drops ? Inner().Window() : KeyWindow());
  if (TheControl()) Inner().Send(CB_SHOWDROPDOWN, drops);
}

/// The keys of a list that hangs down, or that are pressed for it to do so.
bool ComboBoxView::PassesToList(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message != WM_KEYDOWN && message != WM_SYSKEYDOWN) return false;
  const bool moves = wParam == VK_UP || wParam == VK_DOWN;
  if (wParam == VK_F4 || (moves && message == WM_SYSKEYDOWN))
    Drop();
  else if (moves || wParam == VK_PRIOR || wParam == VK_NEXT)
    Inner().Send(message, wParam, lParam);
  else
    return false;
  return true;
}

std::optional<LRESULT> ComboBoxView::AnswerEdit(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_SETFOCUS || message == WM_KILLFOCUS) {
    const LRESULT answer = edit_->PassOn(message, wParam, lParam);
    if (message == WM_SETFOCUS)
      FocusCameFrom(reinterpret_cast<HWND>(wParam));
    else
      Invalidate();
    return answer;
  }
  if (message == WM_LBUTTONDOWN) Context().mouse.ReleaseCapture();
  if (TheControl() && PassesToList(message, wParam, lParam)) return 0;
  return field_ ? field_->Answer(message, wParam, lParam) : std::nullopt;
}

Text ComboBoxView::TipAt(HWND window, Spot /*place*/) const {
  if (field_ || window != Inner().Window()) return {};
  const Text shown = VisibleText(Combo().SelectedText());
  return MeasureText(shown, Letters()).width > TextRoom(Inner().Inside()).extent.width ? shown : Text();
}

KeyUse ComboBoxView::Use(const KeyPress& /*key*/) { return IsDropped() ? KeyUse::Window : KeyUse::Free; }

void ComboBoxView::Notified(int code) {
  if (showing_ || !TheControl()) return;
  switch (code) {
  case CBN_DROPDOWN: chosen_ = false; break;
  case CBN_SELENDOK: chosen_ = true; break;
  case CBN_SELENDCANCEL: chosen_ = false; break;
  case CBN_SELCHANGE:
    if (!IsDropped()) Choose();
    break;
  case CBN_CLOSEUP:
    if (std::exchange(chosen_, false))
      Choose();
    else
      ShowSelection();
    if (edit_ && Inner().HasFocus()) ::SetFocus(edit_->Window());
    break;
  default: break;
  }
}

void ComboBoxView::Choose() {
  if (!std::exchange(telling_, true)) ::PostMessageW(Inner().Window(), kChosen, 0, 0);
}

LRESULT ComboBoxView::TellChoice() {
  telling_ = false;
  const auto chosen = static_cast<int>(Inner().Send(CB_GETCURSEL));
  Context().dispatcher.Dispatch([&] {
    if (chosen >= 0) Combo().SelectItem(chosen);
  });
  if (TheControl()) ShowSelection();
  return 0;
}

// The ground of the field goes on here, with what tells a list: its arrow and the text of the selected item.
void ComboBoxView::PaintClosed() const {
  const Area whole{{}, Inner().Inside()};
  const FieldState state = State();
  Surface surface(whole.extent);
  Drawing drawing(surface, {}, whole);
  drawing.Fill(whole, FaceOf(state).fill);
  const Colour ink = state.enabled ? Palette::Ink : Palette::QuietInk;
  const bool fromRight = ReadingDirection() == Direction::RightToLeft;
  const Text shown = VisibleText(Combo().SelectedText());
  if (!field_)
    drawing.Text(shown, TextRoom(whole.extent), Letters(), ink,
                 {DirectionOf(shown), SideOf(Alignment::Leading, ReadingDirection())});
  constexpr int kHalf = 4;
  const int middle = fromRight ? kArrowRoom / 2 : whole.extent.width - kArrowRoom / 2;
  const int top = whole.extent.height / 2 - kHalf / 2;
  drawing.Triangle({{{middle - kHalf, top}, {middle + kHalf, top}, {middle, top + kHalf}}},
                   state.enabled ? Palette::Ink : Palette::StrongBorder);
  PAINTSTRUCT paint{};
  const HDC device = ::BeginPaint(Inner().Window(), &paint);
  surface.ShowOn(device, whole);
  ::EndPaint(Inner().Window(), &paint);
}

} // namespace quendra::forms::win32
