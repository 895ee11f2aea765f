#pragma once

#include "forms/controls/ListView.h"
#include "forms/view/ControlPlacement.h"
#include "forms/view/Ring.h"

#include <array>
#include <optional>

namespace quendra::forms {

/// What lists look like, in pixels of a form that is shown in a scale and reads in a direction.
class ListLook {
 public:
  ListLook(const Scale& scale, Direction direction) : scale_(scale), direction_(direction) {}

  int RowHeight(int lineHeight) const;
  int HeaderHeight(int lineHeight) const;
  int IconSide() const;

  /// Where a cell has its text; cell 0 has room for the row's icon before it.
  Area TextPlace(Area cell, int number) const;
  /// Where a cell has its text after an icon.
  Area TextAfterIcon(Area cell) const;
  /// Where cell 0 has the row's icon.
  Area IconPlace(Area cell) const;
  /// Where another cell has its icon, beside a text or alone: in the middle then.
  Area CellIconPlace(Area cell, bool besideText) const;
  Side SideOf(Alignment alignment) const { return forms::SideOf(alignment, direction_); }

  Area HeaderTextPlace(Area header) const;
  /// The line, one pixel wide, between a header and the next.
  Area Divider(Area header) const;
  /// The line below the headers.
  static Area HeaderEdge(Area header);
  /// The part of its size that a header's icon is shown in; none is shown larger than the form.
  double IconShare(double width, double height, Area header) const;

  struct Point {
    double x = 0;
    double y = 0;
  };
  /// The corners of the arrow on the header that the rows are sorted by: it points up when ascending.
  std::array<Point, 3> Arrow(Area header, SortOrder order) const;

 private:
  bool ReadsFromRightToLeft() const { return direction_ == Direction::RightToLeft; }
  Area WithoutPadding(Area cell) const;

  Scale scale_;
  Direction direction_;
};

/// What no column can show: longer texts are cut before they are measured.
inline constexpr std::size_t kMostOfCell = 300;

/// Rows of two grounds take turns, from row 0 on.
Colour RowGround(int row, bool selected);
Colour CellInk(const ListRow& row, int cell);

/// The ring in a list that has the focus, for those who use the keys.
std::optional<Ring> RingOfList(bool hasFocus, bool usesKeys);

/// Whether the arrow stands on this column.
bool ShowsArrow(const ListView& list, int column);

} // namespace quendra::forms
