#pragma once

#include "forms/controls/ListView.h"
#include "forms/view/Area.h"
#include "forms/view/Direction.h"
#include "forms/view/Scale.h"
#include "forms/win32/views/InnerWindow.h"

namespace quendra::forms::win32 {

/// The columns of a list's window: as they were set up, as far as there is room. The user's own widths stay
/// until they are set up anew.
class ListColumns {
 public:
  explicit ListColumns(const InnerWindow& window) : window_(window) {}

  /// The columns of the list instead of those that are there.
  void SetUp(const ListView& list, const Scale& scale);
  void Fit(const ListView& list, const Scale& scale);
  /// The user has taken hold of the edge of a column. False for one that is hidden.
  bool SizeByHand(int column);

  int WidthOf(int column) const;
  /// The cells of a row `height` pixels high, where the window stands now and reads as told.
  std::vector<Area> CellsOf(int count, int height, Direction direction) const;

 private:
  void Put(std::size_t number, const Text& name, int width);
  std::vector<int> Widths(const ListView& list, const Scale& scale) const;

  const InnerWindow& window_;
  std::vector<Text> names_;
  bool sizedByHand_ = false;
  bool fitting_ = false;
};

} // namespace quendra::forms::win32
