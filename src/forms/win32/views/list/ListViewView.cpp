#include "forms/win32/views/list/ListViewView.h"

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
  if (aspect == Aspect::All) {
    ColumnsChanged();
    RowsDue(0);
  }
  if (aspect == Aspect::Geometry) FitColumns();
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

void ListViewView::Due() {
  if (!std::exchange(telling_, true)) ::PostMessageW(Inner().Window(), kTell, 0, 0);
}

void ListViewView::RowsDue(int from) {
  rowsDue_ = true;
  due_.AddFrom(from);
  Due();
}

void ListViewView::Tell() {
  if (!TheControl() || !telling_) return;
  if (std::exchange(columnsDue_, false)) TellColumns();
  if (std::exchange(rowsDue_, false)) TellRows();
  RedrawDue();
  telling_ = false;
}

void ListViewView::TellRows() {
  if (std::exchange(told_, List().Count()) != List().Count())
    Quietly([this] {
      Inner().Send(LVM_SETITEMCOUNT, static_cast<WPARAM>(told_), LVSICF_NOINVALIDATEALL | LVSICF_NOSCROLL);
    });
  ShowSelection();
}

void ListViewView::RowAdded(int index) { RowsDue(index - 1); }

void ListViewView::RowRemoved(int index) { RowsDue(index - 1); }

void ListViewView::RowsCleared() { RowsDue(0); }

// Texts are asked for when they are drawn, so a change costs no more than the cell's place on the screen.
void ListViewView::RowChanged(int index, int cell) {
  due_.Add(index - 1, cell);
  Due();
}

void ListViewView::RowsMoved() {
  RowsDue(0);
  header_->Redraw();
}

void ListViewView::ColumnsChanged() {
  columnsDue_ = true;
  Due();
}

void ListViewView::TellColumns() {
  Quietly([this] { columns_->SetUp(List(), Context().scale); });
  FitRows();
  Inner().Redraw();
  header_->Redraw();
}

void ListViewView::FitColumns() {
  if (!columnsDue_) columns_->Fit(List(), Context().scale);
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
  if (before == row) return;
  due_.Add(before);
  due_.Add(row);
  Due();
}

int ListViewView::TopRow() const { return static_cast<int>(Inner().Send(LVM_GETTOPINDEX)); }

Area ListViewView::PlaceOfRow(int row) const {
  const int height = painter_.RowHeight();
  return {{0, painter_.HeaderHeight() + (row - TopRow()) * height}, {Inner().Inside().width, height}};
}

RowsInSight ListViewView::InSight() const {
  RowsInSight sight;
  sight.top = TopRow();
  sight.first = PlaceOfRow(sight.top);
  const int height = sight.first.extent.height;
  sight.count = (Inner().Inside().height - sight.first.corner.top + height - 1) / height;
  // The system counts the pixels of a mirrored window from its right edge, as columns do.
  sight.cells = columns_->CellsOf(static_cast<int>(List().Columns().size()), height, Direction::LeftToRight);
  return sight;
}

void ListViewView::RedrawDue() {
  const HRGN region = ::CreateRectRgn(0, 0, 0, 0);
  for (const Area& place : due_.Take(InSight())) {
    const HRGN part = ::CreateRectRgn(place.corner.left, place.corner.top, place.Right(), place.Bottom());
    ::CombineRgn(region, region, part, RGN_OR);
    ::DeleteObject(part);
  }
  ::InvalidateRgn(Inner().Window(), region, FALSE);
  ::DeleteObject(region);
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
