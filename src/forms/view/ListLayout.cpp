#include "forms/view/ListLayout.h"

#include <algorithm>
#include <cstdint>
#include <numeric>

namespace quendra::forms {

std::vector<int> ColumnWidths(const std::vector<int>& told, int room) {
  const std::int64_t sum = std::accumulate(told.begin(), told.end(), std::int64_t{0});
  if (sum <= room || room < 0) return told;
  // Edges are rounded, not widths: no pixel is lost or too many at the end.
  const auto edge = [&](std::int64_t place) {
    return static_cast<int>((2 * place * room + sum) / (2 * sum));
  };
  std::vector<int> shown;
  std::int64_t place = 0;
  for (const int width : told) {
    shown.push_back(edge(place + width) - edge(place));
    place += width;
  }
  return shown;
}

int WholeRows(int height, int rowHeight) {
  return rowHeight <= 0 ? height : std::max(0, height / rowHeight * rowHeight);
}

} // namespace quendra::forms
