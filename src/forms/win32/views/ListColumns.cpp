#include "forms/win32/views/ListColumns.h"

#include "forms/view/Accessible.h"
#include "forms/view/ListLayout.h"

#include <commctrl.h>

#include <utility>

namespace quendra::forms::win32 {

void ListColumns::SetUp(const ListView& list, const Scale& scale) {
  sizedByHand_ = false;
  while (window_.Send(LVM_DELETECOLUMN, 0)) {
  }
  int number = 0;
  for (const ColumnHeader& column : list.Columns()) {
    // Drawn by us; this is what assistive technology reads.
    Text name = AccessibleNameOf(column);
    LVCOLUMNW made{};
    made.mask = LVCF_TEXT | LVCF_SUBITEM;
    made.pszText = reinterpret_cast<wchar_t*>(name.data());
    made.iSubItem = number;
    window_.Send(LVM_INSERTCOLUMNW, static_cast<WPARAM>(number), reinterpret_cast<LPARAM>(&made));
    ++number;
  }
  Fit(list, scale);
}

void ListColumns::Fit(const ListView& list, const Scale& scale) {
  if (sizedByHand_ || std::exchange(fitting_, true)) return;
  std::vector<int> told;
  for (const ColumnHeader& column : list.Columns()) told.push_back(scale.PixelsX(column.width));
  int number = 0;
  for (const int width : ColumnWidths(told, window_.Inside().width)) {
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
