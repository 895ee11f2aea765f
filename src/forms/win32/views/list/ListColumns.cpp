#include "forms/win32/views/list/ListColumns.h"

#include "forms/view/Accessible.h"
#include "forms/view/ListLayout.h"

#include <commctrl.h>

#include <utility>

namespace quendra::forms::win32 {

// The system lays out its header anew with each column that goes or comes, and a page sets up the same ones
// again whenever it opens: those that are there stay.
void ListColumns::SetUp(const ListView& list, const Scale& scale) {
  sizedByHand_ = false;
  std::vector<Text> names;
  for (const ColumnHeader& column : list.Columns()) names.push_back(AccessibleNameOf(column));
  while (names_.size() > names.size()) {
    names_.pop_back();
    window_.Send(LVM_DELETECOLUMN, names_.size());
  }
  const std::vector<int> widths = Widths(list, scale);
  for (std::size_t number = 0; number < names.size(); ++number) Put(number, names[number], widths[number]);
  Fit(list, scale);
}

std::vector<int> ListColumns::Widths(const ListView& list, const Scale& scale) const {
  std::vector<int> told;
  for (const ColumnHeader& column : list.Columns()) told.push_back(scale.PixelsX(column.width));
  return ColumnWidths(told, window_.Inside().width);
}

// Drawn by us; this is what assistive technology reads.
void ListColumns::Put(std::size_t number, const Text& name, int width) {
  const bool isThere = number < names_.size();
  if (isThere && names_[number] == name) return;
  LVCOLUMNW column{};
  column.mask = LVCF_TEXT | LVCF_SUBITEM | (isThere ? 0U : LVCF_WIDTH);
  column.cx = width;
  column.pszText = const_cast<wchar_t*>(winapi::Wide(name));
  column.iSubItem = static_cast<int>(number);
  window_.Send(isThere ? LVM_SETCOLUMNW : LVM_INSERTCOLUMNW, number, reinterpret_cast<LPARAM>(&column));
  if (!isThere) names_.emplace_back();
  names_[number] = name;
}

void ListColumns::Fit(const ListView& list, const Scale& scale) {
  if (sizedByHand_ || std::exchange(fitting_, true)) return;
  int number = 0;
  for (const int width : Widths(list, scale)) {
    if (width != WidthOf(number))
      window_.Send(LVM_SETCOLUMNWIDTH, static_cast<WPARAM>(number), MAKELPARAM(width, 0));
    ++number;
  }
  fitting_ = false;
}

bool ListColumns::SizeByHand(int column) {
  if (WidthOf(column) < 1) return false;
  sizedByHand_ = true;
  return true;
}

int ListColumns::WidthOf(int column) const {
  return static_cast<int>(window_.Send(LVM_GETCOLUMNWIDTH, static_cast<WPARAM>(column)));
}

std::vector<Area> ListColumns::CellsOf(int count, int height, Direction direction) const {
  const int room = window_.Inside().width;
  int place = -::GetScrollPos(window_.Window(), SB_HORZ);
  std::vector<Area> cells;
  for (int column = 0; column < count; ++column) {
    const int width = WidthOf(column);
    const int left = direction == Direction::RightToLeft ? room - place - width : place;
    cells.push_back({{left, 0}, {width, height}});
    place += width;
  }
  return cells;
}

} // namespace quendra::forms::win32
