#pragma once

#include <vector>

namespace quendra::forms {

// What every view of a list decides alike. All numbers are pixels.

/// The widths that columns are shown in: as told, or in proportion, together as wide as the room, where that
/// is less than their sum. A column of no width stays hidden.
std::vector<int> ColumnWidths(const std::vector<int>& told, int room);

/// The most of a height that rows fill without one being cut.
int WholeRows(int height, int rowHeight);

} // namespace quendra::forms
