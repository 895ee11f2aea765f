#include "forms/view/ListLook.h"

#include "forms/view/Palette.h"

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr int kIconSide = 20;
constexpr int kRoomRoundIcon = 6;
constexpr int kRoomRoundRow = 10;
constexpr int kRoomRoundHeader = 16;
constexpr int kPadding = 8;
constexpr int kDividerInset = 7;
constexpr int kArrowInset = 14;

/// The middle row of pixels, the upper of two.
int MiddleOf(Area area) { return (area.corner.top + area.Bottom() - 1) / 2; }

} // namespace

int ListLook::RowHeight(int lineHeight) const {
  return std::max(scale_.Pixels(kIconSide + kRoomRoundIcon), lineHeight + scale_.Pixels(kRoomRoundRow));
}

int ListLook::HeaderHeight(int lineHeight) const { return lineHeight + scale_.Pixels(kRoomRoundHeader); }

int ListLook::IconSide() const { return scale_.Pixels(kIconSide); }

Area ListLook::WithoutPadding(Area cell) const {
  const int padding = scale_.Pixels(kPadding);
  return {{cell.corner.left + padding, cell.corner.top},
          {cell.extent.width - 2 * padding, cell.extent.height}};
}

Area ListLook::TextPlace(Area cell, int number) const {
  return number == 0 ? TextAfterIcon(cell) : WithoutPadding(cell);
}

Area ListLook::TextAfterIcon(Area cell) const {
  Area place = WithoutPadding(cell);
  const int taken = IconSide() + scale_.Pixels(kPadding);
  if (!ReadsFromRightToLeft()) place.corner.left += taken;
  place.extent.width -= taken;
  return place;
}

Area ListLook::IconPlace(Area cell) const {
  const Area room = WithoutPadding(cell);
  const int side = IconSide();
  const int left = ReadsFromRightToLeft() ? room.Right() - side : room.corner.left;
  return {{left, MiddleOf(room) - side / 2 + 1}, {side, side}};
}

Area ListLook::CellIconPlace(Area cell, bool besideText) const {
  if (besideText) return IconPlace(cell);
  const int side = IconSide();
  return {{cell.corner.left + (cell.extent.width - side) / 2, IconPlace(cell).corner.top}, {side, side}};
}

Area ListLook::HeaderTextPlace(Area header) const { return WithoutPadding(header); }

Area ListLook::Divider(Area header) const {
  const int inset = scale_.Pixels(kDividerInset);
  const int left = ReadsFromRightToLeft() ? header.corner.left : header.Right() - 1;
  return {{left, header.corner.top + inset}, {1, header.extent.height - 2 * inset}};
}

Area ListLook::HeaderEdge(Area header) {
  return {{header.corner.left, header.Bottom() - 1}, {header.extent.width, 1}};
}

double ListLook::IconShare(double width, double height, Area header) const {
  constexpr double kBesideIcon = 4;
  constexpr double kAboveIcon = 8;
  if (width <= 0 || height <= 0) return 0;
  return std::max(0.0, std::min({scale_.zoom, (header.extent.width - kBesideIcon) / width,
                                 (header.extent.height - kAboveIcon) / height}));
}

std::array<ListLook::Point, 3> ListLook::Arrow(Area header, SortOrder order) const {
  constexpr double kHalfWidth = 4;
  const int inset = scale_.Pixels(kArrowInset);
  const double x = ReadsFromRightToLeft() ? header.corner.left + inset : header.Right() - 1 - inset;
  const double y = MiddleOf(header) + 1;
  const double tip = order == SortOrder::Ascending ? -2.5 : 2.5;
  return {{{x - kHalfWidth, y - tip}, {x + kHalfWidth, y - tip}, {x, y + tip}}};
}

Colour RowGround(int row, bool selected) {
  if (selected) return Palette::Selection;
  return row % 2 == 0 ? Palette::Page : Palette::QuietPage;
}

Colour CellInk(const ListRow& row, int cell) { return InkOr(row.CellColour(cell), Palette::Ink); }

std::optional<Ring> RingOfList(bool hasFocus, bool usesKeys) {
  if (!hasFocus || !usesKeys) return std::nullopt;
  return Ring{1, 2, 0, Palette::Focus};
}

bool ShowsArrow(const ListView& list, int column) { return list.Sorted() && list.SortKey() == column; }

} // namespace quendra::forms
