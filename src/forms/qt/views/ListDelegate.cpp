#include "forms/qt/views/ListDelegate.h"

#include "forms/qt/drawing/Conversion.h"

#include <QPainter>

namespace quendra::forms::qt {

QSize ListDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex& /*index*/) const {
  return {40, Look().RowHeight(option.fontMetrics.height())};
}

void ListDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const {
  const ListRow* row = model_.RowAt(index.row());
  // The view itself paints the other grounds before.
  if (option.state & QStyle::State_Selected)
    painter->fillRect(option.rect, ToQColor(RowGround(index.row(), true)));
  const int cell = index.column();
  if (!row || cell > row->CellCount()) return;
  const Area place = ToArea(option.rect);
  const bool hasText = !row->CellText(cell).empty();
  const bool hasIcon = row->CellIcon(cell) != 0;
  if (cell == 0) DrawIcon(*painter, Look().IconPlace(place), row->SmallIcon());
  if (hasIcon) DrawIcon(*painter, Look().CellIconPlace(place, hasText), row->CellIcon(cell));
  const QRect room = ToQRect(hasIcon ? Look().TextAfterIcon(place) : Look().TextPlace(place, cell));
  if (!hasText || room.width() <= 0) return;

  const Text visible = VisibleText(row->CellText(cell), LineBreaks::Show, kMostOfCell);
  QFont font = option.font;
  font.setBold(row->CellBold(cell));
  painter->setFont(font);
  painter->setPen(ToQColor(CellInk(*row, cell)));
  painter->setLayoutDirection(ToQt(DirectionOf(visible)));
  const Alignment alignment = model_.List()->Columns()[static_cast<std::size_t>(cell)].alignment;
  const auto side = ToQt(Look().SideOf(alignment));
  painter->drawText(room, static_cast<int>(side | Qt::AlignVCenter) | Qt::TextSingleLine,
                    painter->fontMetrics().elidedText(ToQString(visible), Qt::ElideRight, room.width()));
}

void ListDelegate::DrawIcon(QPainter& painter, const Area& place, int number) const {
  const QPixmap icon = model_.SmallIcon(number, place.extent.width);
  if (icon.isNull()) return;
  const QSizeF beside = QSizeF(place.extent.width, place.extent.height) - icon.deviceIndependentSize();
  painter.drawPixmap(QPointF(place.corner.left + beside.width() / 2, place.corner.top + beside.height() / 2),
                     icon);
}

} // namespace quendra::forms::qt
