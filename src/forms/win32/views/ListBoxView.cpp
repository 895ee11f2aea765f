#include "forms/win32/views/ListBoxView.h"

#include "forms/view/Keyboard.h"
#include "forms/view/ListLook.h"
#include "forms/view/VisibleText.h"
#include "forms/win32/input/MouseInput.h"
#include "forms/win32/views/ItemPainting.h"

#include <utility>

namespace quendra::forms::win32 {

namespace {
/// The room of the field's edge and ring.
constexpr int kItemsEdge = 4;
constexpr int kRoomRoundItem = 4;
} // namespace

ListBoxView::ListBoxView(ViewContext& context, ListBox& list, HWND parent)
    : FieldView(context, list, parent) {
  Hold(L"LISTBOX", LBS_NOTIFY | LBS_HASSTRINGS | LBS_OWNERDRAWFIXED | LBS_NOINTEGRALHEIGHT | WS_VSCROLL,
       BarSide());
}

int ListBoxView::RowHeight() const {
  return Context().fonts.LineHeight(Letters()) + Context().scale.Pixels(kRoomRoundItem);
}

Area ListBoxView::Room(Extent field) const { return Area{{}, field}.GrownBy(-kItemsEdge); }

void ListBoxView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Font)) {
    GiveLetters();
    Inner().Send(LB_SETITEMHEIGHT, 0, RowHeight());
  }
  if (Concerns(aspect, Aspect::Items)) FillItems();
  if (Concerns(aspect, Aspect::Items) || aspect == Aspect::Selection) ShowSelection();
}

void ListBoxView::FillItems() const {
  // Items only grow until they are cleared, so the ones that stand here already are right.
  int there = static_cast<int>(Inner().Send(LB_GETCOUNT));
  if (there > List().ListCount() || List().ListCount() == 0) {
    Inner().Send(LB_RESETCONTENT);
    there = 0;
  }
  for (int i = there; i < List().ListCount(); ++i) {
    const Text shown = VisibleText(List().List(i));
    Inner().Send(LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(winapi::Wide(shown)));
  }
}

void ListBoxView::ShowSelection() const {
  const auto shown = static_cast<int>(Inner().Send(LB_GETCURSEL));
  if (shown != List().ListIndex()) Inner().Send(LB_SETCURSEL, static_cast<WPARAM>(List().ListIndex()));
}

std::optional<LRESULT> ListBoxView::Answer(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message != WM_DRAWITEM || !TheControl()) return FieldView::Answer(message, wParam, lParam);
  const auto& due = *reinterpret_cast<const DRAWITEMSTRUCT*>(lParam);
  const auto item = static_cast<int>(due.itemID);
  if (item < 0 || item >= List().ListCount()) return TRUE;
  const bool selected = (due.itemState & ODS_SELECTED) != 0;
  const Colour ground = selected ? RowGround(0, true) : FaceOf(State()).fill;
  PaintItem(due, {VisibleText(List().List(item)), Letters(), ground, ReadingDirection()});
  return TRUE;
}

std::optional<LRESULT> ListBoxView::AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!TheControl()) return std::nullopt;
  switch (message) {
  case WM_LBUTTONDOWN: return PassMouse(message, wParam, lParam);
  case WM_MOUSEMOVE:
    if (!(wParam & MK_LBUTTON)) return std::nullopt;
    return PassMouse(message, wParam, lParam);
  case WM_LBUTTONUP: return PassMouse(message, wParam, lParam);
  // The form has what is typed with Ctrl; a list would look for an item.
  case WM_CHAR:
    if (PassesList(ShiftStateNow(), true)) return 0;
    return std::nullopt;
  default: return FieldView::AnswerInner(message, wParam, lParam);
  }
}

LRESULT ListBoxView::PassMouse(UINT message, WPARAM wParam, LPARAM lParam) {
  const bool before = std::exchange(byMouse_, true);
  LRESULT answer = 0;
  // The window would take the item nearest to a place below them all.
  if (message == WM_LBUTTONDOWN && HIWORD(Inner().Send(LB_ITEMFROMPOINT, 0, lParam)))
    ::SetFocus(Inner().Window());
  else
    answer = Inner().PassOn(message, wParam, lParam);
  byMouse_ = before;
  if (TheControl()) List().Selected(static_cast<int>(Inner().Send(LB_GETCURSEL)));
  return answer;
}

void ListBoxView::Notified(int code) {
  if (code != LBN_SELCHANGE || byMouse_ || !TheControl()) return;
  const auto chosen = static_cast<int>(Inner().Send(LB_GETCURSEL));
  Context().dispatcher.Dispatch([&] { List().SelectItem(chosen); });
}

Text ListBoxView::TipAt(HWND /*window*/, Spot place) const {
  const LRESULT found = Inner().Send(LB_ITEMFROMPOINT, 0, MAKELPARAM(place.left, place.top));
  if (HIWORD(found) || LOWORD(found) >= List().ListCount()) return {};
  const Text shown = VisibleText(List().List(LOWORD(found)));
  return MeasureText(shown, Letters()).width > TextRoomOfItem(Inner().Inside().width) ? shown : Text();
}

KeyUse ListBoxView::Use(const KeyPress& key) {
  const auto item = ItemReachedBy(List(), key);
  if (!item) return KeyUse::Free;
  if (*item != List().ListIndex()) Context().dispatcher.Dispatch([&] { List().SelectItem(*item); });
  return KeyUse::Done;
}

} // namespace quendra::forms::win32
