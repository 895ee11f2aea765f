#include "forms/view/Accessible.h"
#include "forms/view/Keyboard.h"
#include "forms/view/VisibleText.h"
#include "forms/win32/input/MouseInput.h"
#include "forms/win32/views/list/ListViewView.h"

#include <commctrl.h>

// What the windows of a list tell, and what is done about it.

namespace quendra::forms::win32 {

namespace {

int ColumnOf(const NMHDR& notice) { return reinterpret_cast<const NMHEADERW&>(notice).iItem; }

/// Copies as much of a text as there is room for.
void Copy(TextView text, wchar_t* room, int count) {
  if (!room || count < 1) return;
  const std::size_t length = std::min(text.size(), static_cast<std::size_t>(count - 1));
  *std::copy_n(text.begin(), length, room) = L'\0';
}

Text KeyOfIcon(const ImageList* images, int number) {
  return images && number >= 1 && number <= images->Count() ? images->Item(number).Key : Text();
}

} // namespace

std::optional<LRESULT> ListViewView::Answer(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
  case WM_MEASUREITEM:
    reinterpret_cast<MEASUREITEMSTRUCT*>(lParam)->itemHeight = static_cast<UINT>(painter_.RowHeight());
    return TRUE;
  case WM_DRAWITEM: return TRUE; // rows are drawn where the window is
  case WM_NOTIFY:
    if (TheControl()) return Told(*reinterpret_cast<const NMHDR*>(lParam));
    return 0;
  default: return FieldView::Answer(message, wParam, lParam);
  }
}

std::optional<LRESULT> ListViewView::Told(const NMHDR& notice) {
  switch (notice.code) {
  case LVN_GETDISPINFOW: TellText(const_cast<NMHDR&>(notice)); return 0;
  case LVN_ODFINDITEMW: return Search(notice);
  case LVN_COLUMNCLICK: {
    const int column = reinterpret_cast<const NMLISTVIEW&>(notice).iSubItem;
    Context().dispatcher.Dispatch([&] {
      if (TheControl()) List().ColumnClick(column + 1);
    });
    header_->Redraw();
    return 0;
  }
  case LVN_ITEMCHANGED: {
    const auto& change = reinterpret_cast<const NMLISTVIEW&>(notice);
    if (!quiet_ && change.iItem >= 0 && change.uNewState & LVIS_SELECTED) Choose(change.iItem);
    return 0;
  }
  default: return 0;
  }
}

void ListViewView::Choose(int row) {
  if (!TheControl() || row < 0 || row >= List().Count()) return;
  Context().dispatcher.Dispatch([&] { List().Select(&List().Row(row + 1)); });
}

void ListViewView::TellText(NMHDR& notice) const {
  LVITEMW& asked = reinterpret_cast<NMLVDISPINFOW&>(notice).item;
  if (!(asked.mask & LVIF_TEXT)) return;
  Text shown;
  if (asked.iItem >= 0 && asked.iItem < List().Count()) {
    const ListRow& row = List().Row(asked.iItem + 1);
    if (asked.iSubItem >= 0 && asked.iSubItem <= row.CellCount()) {
      shown = VisibleText(row.CellText(asked.iSubItem));
      // An icon alone is read by its key.
      if (shown.empty()) shown = KeyOfIcon(List().SmallIcons, row.CellIcon(asked.iSubItem));
    }
  }
  Copy(shown, asked.pszText, asked.cchTextMax);
}

/// The row whose first cell begins with what was typed; -1 for none.
int ListViewView::Search(const NMHDR& notice) const {
  const auto& wanted = reinterpret_cast<const NMLVFINDITEMW&>(notice);
  if (!(wanted.lvfi.flags & (LVFI_STRING | LVFI_PARTIAL)) || !wanted.lvfi.psz) return -1;
  const Text begin = Lowered(winapi::TextOf(wanted.lvfi.psz));
  const int count = List().Count();
  for (int step = 0; step < count; ++step) {
    const int row = (std::max(0, wanted.iStart) + step) % count;
    if (Lowered(VisibleText(List().Row(row + 1).CellText(0))).starts_with(begin)) return row;
  }
  return -1;
}

std::optional<LRESULT> ListViewView::AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!TheControl() || !header_) return std::nullopt;
  switch (message) {
  case WM_ERASEBKGND: return 1;
  case WM_PAINT:
    Tell();
    RedrawIfScrolled();
    PaintRows();
    return 0;
  case kTell: Tell(); return 0;
  case WM_NCCALCSIZE: return LeaveRoomForBar(wParam, lParam);
  case WM_KEYDOWN: Tell(); return std::nullopt;
  case WM_NOTIFY: return ToldByHeader(*reinterpret_cast<const NMHDR*>(lParam));
  case WM_SIZE: {
    const LRESULT answer = Inner().PassOn(message, wParam, lParam);
    FitColumns();
    FitRows();
    Inner().Redraw();
    return answer;
  }
  case WM_LBUTTONDOWN:
  case WM_LBUTTONDBLCLK:
  case WM_RBUTTONDOWN:
  case WM_RBUTTONDBLCLK:
  case WM_LBUTTONUP:
  case WM_RBUTTONUP: return TakeMouse(message, wParam, lParam);
  case WM_MOUSEMOVE:
    if (wParam & MK_LBUTTON) return TakeMouse(message, wParam, lParam);
    return std::nullopt;
  case WM_CHAR:
    if (PassesList(ShiftStateNow(), true)) return 0;
    return std::nullopt;
  case WM_SETFOCUS:
  case WM_KILLFOCUS: Inner().Redraw(); [[fallthrough]];
  default: return FieldView::AnswerInner(message, wParam, lParam);
  }
}

// The window's own way would keep the thread to itself as long as the button is held, and give up the choice
// in places without a row.
// Not all systems find the side of the bar where a mirrored window stands in one that isn't.
LRESULT ListViewView::LeaveRoomForBar(WPARAM wParam, LPARAM lParam) {
  RECT& place = *reinterpret_cast<RECT*>(lParam); // which the longer record begins with
  const RECT before = place;
  const LRESULT answer = Inner().PassOn(WM_NCCALCSIZE, wParam, lParam);
  if (ReadingDirection() == Direction::RightToLeft && place.left == before.left)
    ::OffsetRect(&place, before.right - place.right, 0);
  return answer;
}

LRESULT ListViewView::TakeMouse(UINT message, WPARAM /*wParam*/, LPARAM lParam) {
  if (message == WM_LBUTTONUP || message == WM_RBUTTONUP) {
    if (::GetCapture() == Inner().Window()) ::ReleaseCapture();
    return 0;
  }
  if (message != WM_MOUSEMOVE) {
    ::SetFocus(Inner().Window());
    if (!TheControl()) return 0;
    if (message == WM_LBUTTONDOWN) ::SetCapture(Inner().Window());
  } else if (::GetCapture() != Inner().Window()) {
    return 0;
  }
  const int depth = static_cast<short>(HIWORD(lParam)) - painter_.HeaderHeight();
  if (depth < 0) return 0;
  const int row = TopRow() + depth / painter_.RowHeight();
  if (row < List().Count()) Choose(row);
  return 0;
}

std::optional<LRESULT> ListViewView::ToldByHeader(const NMHDR& notice) {
  if (notice.hwndFrom != header_->Window()) return std::nullopt;
  switch (notice.code) {
  case HDN_BEGINTRACKA:
  case HDN_BEGINTRACKW:
  case HDN_DIVIDERDBLCLICKA:
  case HDN_DIVIDERDBLCLICKW:
    if (!columns_->SizeByHand(ColumnOf(notice))) return TRUE;
    return std::nullopt;
  case HDN_ITEMCHANGEDA:
  case HDN_ITEMCHANGEDW: Inner().Redraw(); return std::nullopt;
  default: return std::nullopt;
  }
}

std::optional<LRESULT> ListViewView::AnswerHeader(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!TheControl()) return std::nullopt;
  switch (message) {
  case WM_ERASEBKGND: return 1;
  case WM_PAINT:
    Tell();
    PaintHeaders();
    return 0;
  case HDM_LAYOUT: {
    const LRESULT answer = header_->PassOn(message, wParam, lParam);
    const auto& layout = *reinterpret_cast<const HDLAYOUT*>(lParam);
    // In all rows' room the header takes what its look needs.
    const int beside = painter_.HeaderHeight() - layout.pwpos->cy;
    layout.pwpos->cy += beside;
    layout.prc->top += beside;
    return answer;
  }
  default: return std::nullopt;
  }
}

} // namespace quendra::forms::win32
