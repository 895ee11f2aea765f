#pragma once

#include "forms/controls/ListView.h"
#include "forms/view/ListLook.h"
#include "forms/win32/drawing/Drawing.h"
#include "forms/win32/views/ViewContext.h"

namespace quendra::forms::win32 {

/// Draws the rows and headers of a list. All places are those of the screen: the first column of a list that
/// reads from right to left stands at the right.
class ListPainter {
 public:
  ListPainter(ViewContext& context, const ListView& list, Direction direction)
      : context_(context), list_(list), direction_(direction) {}

  ListLook Look() const { return {context_.scale, direction_}; }
  int RowHeight() const;
  int HeaderHeight() const;

  /// The text of a cell that stands here, whole, where it is cut; else empty.
  Text CutText(const ListRow& row, int cell, Area place) const;
  /// What a header's icon stands for, or a caption that is cut; else empty.
  Text CutText(const ColumnHeader& column, Area place) const;

  /// The row of this number, from 0 on; plain ground below the last.
  void PaintRow(Drawing& drawing, int row, Area place, const std::vector<Area>& cells);
  void PaintHeader(Drawing& drawing, int column, Area place);

 private:
  HFONT Letters(bool bold) const;
  Area TextRoom(const ListRow& row, int cell, Area place) const;
  void PaintCell(Drawing& drawing, const ListRow& row, int cell, Area place);
  void PaintIcon(Drawing& drawing, int number, Area place);
  void PaintHeaderIcon(Drawing& drawing, int number, Area header);
  void PaintCaption(Drawing& drawing, const ColumnHeader& column, Area header);
  const Bitmap* SmallIcon(int number, Extent bounds);

  /// A small icon in the size that it was last shown in.
  struct FittedIcon {
    Picture picture;
    Extent bounds{};
    Bitmap bitmap;
  };

  ViewContext& context_;
  const ListView& list_;
  Direction direction_;
  std::vector<FittedIcon> icons_;
};

} // namespace quendra::forms::win32
