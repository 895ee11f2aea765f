#include "forms/win32/views/ListViewView.h"

#include "forms/view/Accessible.h"
#include "forms/view/Keyboard.h"
#include "forms/view/ListLayout.h"
#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"
#include "forms/win32/input/MouseInput.h"

#include <commctrl.h>

#include <utility>

namespace quendra::forms::win32 {

namespace {

constexpr int kEdge = 1;

DWORD Mirrored(Direction direction) { return direction == Direction::RightToLeft ? WS_EX_LAYOUTRTL : 0; }

} // namespace

ListViewView::ListViewView(ViewContext& context, ListView& list, HWND parent)
    : FieldView(context, list, parent), painter_(context, list, ReadingDirection()) {
  Hold(WC_LISTVIEWW,
       LVS_REPORT | LVS_OWNERDATA | LVS_OWNERDRAWFIXED | LVS_SINGLESEL | LVS_SHOWSELALWAYS | WS_CLIPCHILDREN,
       Mirrored(ReadingDirection()));
  columns_.emplace(Inner());
  Inner().Send(LVM_SETEXTENDEDLISTVIEWSTYLE, LVS_EX_FULLROWSELECT, LVS_EX_FULLROWSELECT);
  header_.emplace(
      *this, reinterpret_cast<HWND>(Inner().Send(LVM_GETHEADER)),
      [this](UINT message, WPARAM wParam, LPARAM lParam) { return AnswerHeader(message, wParam, lParam); });
  list.Observe(this);
}

void ListViewView::Release() {
  if (!TheControl()) return;
  List().Observe(nullptr);
  FieldView::Release();
}

void ListViewView::ControlGone() {
  FieldView::ControlGone();
  Quietly([this] { Inner().Send(LVM_SETITEMCOUNT, 0, 0); });
}

template <typename Change> void ListViewView::Quietly(Change change) {
  const bool before = std::exchange(quiet_, true);
  change();
  quiet_ = before;
}

void ListViewView::Paint(Drawing& drawing) {
  const Area whole{{}, WindowPlace().extent};
  drawing.RoundRect(whole, 0, Palette::Page, Palette::StrongBorder);
}

void ListViewView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Font)) SetRowHeight();
  if (aspect == Aspect::All) ColumnsChanged();
  if (aspect == Aspect::Geometry) columns_->Fit(List(), Context().scale);
  if (aspect == Aspect::Font) FitRows();
  if (aspect == Aspect::Selection) ShowSelection();
}

// The letters are given for the heights that the system makes of them; ours come after.
void ListViewView::SetRowHeight() {
  canvas_.reset();
  GiveLetters();
  // Asks for the height of a row.
  WINDOWPOS same{};
  same.hwnd = Inner().Window();
  const Area room = Room(WindowPlace().extent);
  same.x = room.corner.left;
  same.y = room.corner.top;
  same.cx = room.extent.width;
  same.cy = room.extent.height;
  same.flags = SWP_NOZORDER | SWP_NOACTIVATE;
  Inner().Send(WM_WINDOWPOSCHANGED, 0, reinterpret_cast<LPARAM>(&same));
}

void ListViewView::RowsDue(int from) {
  RedrawFrom(from);
  if (!std::exchange(rowsDue_, true)) ::PostMessageW(Inner().Window(), kTellRows, 0, 0);
}

void ListViewView::TellRows() {
  if (!TheControl() || !std::exchange(rowsDue_, false)) return;
  Quietly([this] {
    Inner().Send(LVM_SETITEMCOUNT, static_cast<WPARAM>(List().Count()),
                 LVSICF_NOINVALIDATEALL | LVSICF_NOSCROLL);
  });
  ShowSelection();
}

void ListViewView::RowAdded(int index) { RowsDue(index - 1); }

void ListViewView::RowRemoved(int index) { RowsDue(index - 1); }

void ListViewView::RowsCleared() { RowsDue(0); }

// Texts are asked for when they are drawn, so a change costs no more than the cell's place on the screen.
void ListViewView::RowChanged(int index, int cell) {
  if (cell >= static_cast<int>(List().Columns().size())) return;
  Area place = PlaceOfRow(index - 1);
  const Extent inside = Inner().Inside();
  if (place.Bottom() <= painter_.HeaderHeight() || place.corner.top >= inside.height) return;
  RECT due{0, place.corner.top, place.Right(), place.Bottom()};
  RECT part{};
  // The system counts the pixels of a mirrored window from its right edge, as columns do.
  due.left = -::GetScrollPos(Inner().Window(), SB_HORZ);
  for (int column = 0; column < cell; ++column) due.left += columns_->WidthOf(column);
  due.right = due.left + columns_->WidthOf(cell);
  const RECT all{0, 0, inside.width, inside.height};
  if (::IntersectRect(&part, &due, &all)) ::InvalidateRect(Inner().Window(), &part, FALSE);
}

void ListViewView::RowsMoved() {
  RowsDue(0);
  header_->Redraw();
}

void ListViewView::ColumnsChanged() {
  Quietly([this] { columns_->SetUp(List(), Context().scale); });
  rowsDue_ = true;
  TellRows();
  FitRows();
  Inner().Redraw();
  header_->Redraw();
}

void ListViewView::ShowSelection() {
  if (rowsDue_) return;
  const int top = TopRow();
  const ListRow* selected = List().SelectedItem();
  const int row = selected ? List().IndexOf(*selected) - 1 : -1;
  Quietly([&] {
    constexpr UINT kBoth = LVIS_SELECTED | LVIS_FOCUSED;
    LVITEMW state{};
    state.stateMask = kBoth;
    const auto held = static_cast<int>(Inner().Send(LVM_GETNEXTITEM, static_cast<WPARAM>(-1), LVNI_SELECTED));
    if (held >= 0 && held != row)
      Inner().Send(LVM_SETITEMSTATE, static_cast<WPARAM>(held), reinterpret_cast<LPARAM>(&state));
    state.state = kBoth;
    if (row >= 0 && held != row)
      Inner().Send(LVM_SETITEMSTATE, static_cast<WPARAM>(row), reinterpret_cast<LPARAM>(&state));
    // The view doesn't go after it: rows change places every second, and it would jump under the reader's
    // eyes. Not all systems leave it in its place.
    if (const int beside = top - TopRow(); held != row && beside != 0)
      Inner().Send(LVM_SCROLL, 0, beside * painter_.RowHeight());
  });
  const int before = std::exchange(shown_, row);
  RedrawRow(before);
  RedrawRow(row);
}

int ListViewView::TopRow() const { return static_cast<int>(Inner().Send(LVM_GETTOPINDEX)); }

Area ListViewView::PlaceOfRow(int row) const {
  const int height = painter_.RowHeight();
  return {{0, painter_.HeaderHeight() + (row - TopRow()) * height}, {Inner().Inside().width, height}};
}

void ListViewView::RedrawRow(int row) const {
  if (row < 0) return;
  const Area place = PlaceOfRow(row);
  const RECT due{0, place.corner.top, place.Right(), place.Bottom()};
  ::InvalidateRect(Inner().Window(), &due, FALSE);
}

void ListViewView::RedrawFrom(int row) const {
  const Extent inside = Inner().Inside();
  const RECT due{0, PlaceOfRow(row).corner.top, inside.width, inside.height};
  ::InvalidateRect(Inner().Window(), &due, FALSE);
}

Area ListViewView::Room(Extent field) const { return Area{{}, field}.GrownBy(-kEdge); }

void ListViewView::PutInPlace() {
  FieldView::PutInPlace();
  FitRows();
}

void ListViewView::FitRows() {
  if (!TheControl() || std::exchange(fittingRows_, true)) return;
  Area place = Place();
  // Edge, header and a scroll bar below the rows.
  RECT window{};
  ::GetWindowRect(Inner().Window(), &window);
  const int bar = static_cast<int>(window.bottom - window.top) - Inner().Inside().height;
  const int around = 2 * kEdge + painter_.HeaderHeight() + bar;
  place.extent.height = around + WholeRows(place.extent.height - around, painter_.RowHeight());
  MoveTo(place);
  fittingRows_ = false;
}

} // namespace quendra::forms::win32
