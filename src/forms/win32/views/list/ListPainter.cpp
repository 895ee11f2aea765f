#include "forms/win32/views/list/ListPainter.h"

#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"
#include "forms/view/paint/Stretch.h"

#include <algorithm>
#include <cmath>

namespace quendra::forms::win32 {

namespace {

const forms::Picture* PictureIn(const ImageList* images, int number) {
  return images && number >= 1 && number <= images->Count() ? &images->Item(number).picture : nullptr;
}

Area Amid(Extent extent, Area room) {
  return {{room.corner.left + (room.extent.width - extent.width) / 2,
           room.corner.top + (room.extent.height - extent.height) / 2},
          extent};
}

int Rounded(double length) { return static_cast<int>(std::lround(length)); }

} // namespace

HFONT ListPainter::Letters(bool bold) const {
  Font font = list_.TextFont();
  font.bold = font.bold || bold;
  return context_.fonts.FontOf(font, context_.scale);
}

int ListPainter::RowHeight() const { return Look().RowHeight(context_.fonts.LineHeight(Letters(false))); }

int ListPainter::HeaderHeight() const {
  return Look().HeaderHeight(context_.fonts.LineHeight(Letters(false)));
}

void ListPainter::PaintRow(Drawing& drawing, int row, Area place, const std::vector<Area>& cells) {
  if (row >= list_.Count()) return drawing.Fill(place, Palette::Page);
  const ListRow& shown = list_.Row(row + 1);
  drawing.Fill(place, RowGround(row, list_.SelectedItem() == &shown));
  const int count = std::min(shown.CellCount() + 1, static_cast<int>(cells.size()));
  for (int cell = 0; cell < count; ++cell) {
    const Area& part = cells[static_cast<std::size_t>(cell)];
    if (part.extent.width > 0) PaintCell(drawing, shown, cell, part);
  }
}

void ListPainter::PaintCell(Drawing& drawing, const ListRow& row, int cell, Area place) {
  const TextView text = row.CellText(cell);
  const int icon = row.CellIcon(cell);
  if (cell == 0) PaintIcon(drawing, row.SmallIcon(), Look().IconPlace(place));
  if (icon) PaintIcon(drawing, icon, Look().CellIconPlace(place, !text.empty()));
  const Area room = TextRoom(row, cell, place);
  if (text.empty() || room.extent.width <= 0) return;
  const Text visible = VisibleText(text, LineBreaks::Show, kMostOfCell);
  const Alignment alignment = list_.Columns()[static_cast<std::size_t>(cell)].alignment;
  drawing.Within(place).Text(visible, {{room.corner.left - place.corner.left, 0}, room.extent},
                             Letters(row.CellBold(cell)), CellInk(row, cell),
                             {DirectionOf(visible), Look().SideOf(alignment)});
}

Area ListPainter::TextRoom(const ListRow& row, int cell, Area place) const {
  return row.CellIcon(cell) ? Look().TextAfterIcon(place) : Look().TextPlace(place, cell);
}

Text ListPainter::CutText(const ListRow& row, int cell, Area place) const {
  const Text shown = VisibleText(row.CellText(cell));
  const int needed = MeasureText(shown, Letters(row.CellBold(cell))).width;
  return needed > TextRoom(row, cell, place).extent.width ? shown : Text();
}

Text ListPainter::CutText(const ColumnHeader& column, Area place) const {
  if (column.caption.empty()) return VisibleText(column.description);
  const Text shown = VisibleText(column.caption);
  const int needed = MeasureText(shown, Letters(false)).width;
  return needed > Look().HeaderTextPlace(place).extent.width ? shown : Text();
}

void ListPainter::PaintIcon(Drawing& drawing, int number, Area place) {
  const Bitmap* icon = SmallIcon(number, place.extent);
  if (icon) drawing.Picture(*icon, Amid({icon->width, icon->height}, place));
}

// Stretching a picture takes longer than all else in a row.
const Bitmap* ListPainter::SmallIcon(int number, Extent bounds) {
  const forms::Picture* picture = PictureIn(list_.SmallIcons, number);
  if (!picture || picture->IsNone()) return nullptr;
  const auto place = static_cast<std::size_t>(number - 1);
  if (icons_.size() <= place) icons_.resize(place + 1);
  FittedIcon& kept = icons_[place];
  if (kept.picture != *picture || kept.bounds != bounds) {
    const Bitmap& whole = context_.pictures.BitmapOf(*picture);
    if (!IsWhole(whole)) return nullptr;
    kept = {*picture, bounds, Stretched(whole, FittedInto({whole.width, whole.height}, bounds))};
  }
  return &kept.bitmap;
}

void ListPainter::PaintHeader(Drawing& drawing, int column, Area place) {
  drawing.Fill(place, Palette::QuietPage);
  drawing.Fill(ListLook::HeaderEdge(place), Palette::Border);
  if (column >= static_cast<int>(list_.Columns().size())) return;
  drawing.Fill(Look().Divider(place), Palette::Border);
  if (ShowsArrow(list_, column)) {
    std::array<Spot, 3> arrow{};
    const auto corners = Look().Arrow(place, list_.Order());
    std::transform(corners.begin(), corners.end(), arrow.begin(), [](const ListLook::Point& corner) {
      return Spot{Rounded(corner.x), Rounded(corner.y)};
    });
    drawing.Triangle(arrow, Palette::QuietInk);
  }
  const ColumnHeader& header = list_.Columns()[static_cast<std::size_t>(column)];
  PaintHeaderIcon(drawing, header.icon, place);
  PaintCaption(drawing, header, place);
}

void ListPainter::PaintHeaderIcon(Drawing& drawing, int number, Area header) {
  const forms::Picture* picture = PictureIn(list_.HeaderIcons, number);
  if (!picture) return;
  const Bitmap& icon = context_.pictures.BitmapOf(*picture);
  const double share = Look().IconShare(icon.width, icon.height, header);
  drawing.Picture(icon, Amid({Rounded(icon.width * share), Rounded(icon.height * share)}, header));
}

void ListPainter::PaintCaption(Drawing& drawing, const ColumnHeader& column, Area header) {
  const Text caption = VisibleText(column.caption);
  const Area room = Look().HeaderTextPlace(header);
  if (room.extent.width <= 0) return;
  drawing.Within(header).Text(caption, {{room.corner.left - header.corner.left, 0}, room.extent},
                              Letters(false), Palette::QuietInk,
                              {DirectionOf(caption), Look().SideOf(column.alignment)});
}

} // namespace quendra::forms::win32
