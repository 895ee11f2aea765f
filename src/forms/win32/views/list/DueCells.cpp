#include "forms/win32/views/list/DueCells.h"

#include "forms/view/paint/Raster.h"

#include <algorithm>

namespace quendra::forms::win32 {

void DueCells::Add(int row, int cell) {
  firstCell_ = std::min(firstCell_, cell);
  lastCell_ = std::max(lastCell_, cell);
  if (rows_.empty() || rows_.back() != row) rows_.push_back(row);
}

void DueCells::Add(int row) {
  Add(row, 0);
  Add(row, kAllCells);
}

void DueCells::AddFrom(int row) {
  from_ = from_ == kNone ? row : std::min(from_, row);
  Add(row);
}

/// The part of the first row that lies above or below all that is due.
Area DueCells::Across(const RowsInSight& sight) const {
  const int last = static_cast<int>(sight.cells.size()) - 1;
  if (lastCell_ > last || firstCell_ > last) return sight.first;
  const Area& begin = sight.cells[static_cast<std::size_t>(firstCell_)];
  const Area& end = sight.cells[static_cast<std::size_t>(lastCell_)];
  return CommonPart(sight.first, {{begin.corner.left, sight.first.corner.top},
                                  {end.Right() - begin.corner.left, sight.first.extent.height}});
}

std::vector<Area> DueCells::Take(const RowsInSight& sight) {
  std::vector<bool> due(static_cast<std::size_t>(std::max(sight.count, 0)));
  for (const int row : rows_)
    if (row >= sight.top && row < sight.top + sight.count)
      due[static_cast<std::size_t>(row - sight.top)] = true;
  if (from_ != kNone && from_ < sight.top + sight.count)
    std::fill(due.begin() + std::max(0, from_ - sight.top), due.end(), true);

  const Area across = Across(sight);
  std::vector<Area> places;
  for (std::size_t line = 0; line < due.size() && across.extent.width > 0; ++line) {
    if (!due[line]) continue;
    if (line > 0 && due[line - 1]) {
      places.back().extent.height += across.extent.height;
      continue;
    }
    Area place = across;
    place.corner.top += static_cast<int>(line) * across.extent.height;
    places.push_back(place);
  }
  *this = {};
  return places;
}

} // namespace quendra::forms::win32
