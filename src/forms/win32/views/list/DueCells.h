#pragma once

#include "forms/view/Area.h"

#include <vector>

namespace quendra::forms::win32 {

/// The rows of a list that its window shows: where each stands, and the cells of the first.
struct RowsInSight {
  int top = 0;   ///< the first
  int count = 0; ///< a part of the last may be out of sight
  Area first{};
  std::vector<Area> cells{};
};

/// What of a list's rows is to be drawn anew. A handler tells of hundreds of changes, most of them out of
/// sight, and the window is told once.
class DueCells {
 public:
  void Add(int row, int cell);
  /// A whole row.
  void Add(int row);
  void AddFrom(int row);

  /// The places in sight of what was added, top down; rows side by side are one. Forgets it all.
  std::vector<Area> Take(const RowsInSight& sight);

 private:
  static constexpr int kNone = -1;
  static constexpr int kAllCells = 1 << 30;

  Area Across(const RowsInSight& sight) const;

  std::vector<int> rows_;
  int from_ = kNone; ///< this one and all below
  int firstCell_ = kAllCells;
  int lastCell_ = 0;
};

} // namespace quendra::forms::win32
