#include "forms/qt/views/ListHeader.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/view/Palette.h"

#include <QPainter>
#include <QPolygonF>

namespace quendra::forms::qt {

ListHeader::ListHeader(const ListModel& model, const Scale& scale, Direction direction, QWidget* parent)
    : QHeaderView(Qt::Horizontal, parent), model_(model), scale_(scale), direction_(direction) {
  setSectionsClickable(true);
  setHighlightSections(false);
  setMinimumSectionSize(0);
  setStretchLastSection(false);
}

QSize ListHeader::sizeHint() const {
  return {QHeaderView::sizeHint().width(), fontMetrics().height() + scale_.Pixels(16)};
}

void ListHeader::paintSection(QPainter* painter, const QRect& rect, int section) const {
  if (rect.width() <= 0 || section >= model_.columnCount()) return;
  const ListView& list = *model_.List();
  const ColumnHeader& column = list.Columns()[static_cast<std::size_t>(section)];
  painter->save();
  painter->fillRect(rect, ToQColor(Palette::QuietPage));
  painter->setPen(ToQColor(Palette::Border));
  // Filled: at a scale of the screen a line ends short of its last pixel.
  painter->fillRect(QRect(rect.left(), rect.bottom(), rect.width(), 1), ToQColor(Palette::Border));
  const int divider = direction_ == Direction::RightToLeft ? rect.left() : rect.right();
  painter->drawLine(divider, rect.top() + scale_.Pixels(7), divider, rect.bottom() - scale_.Pixels(7));
  if (list.Sorted() && list.SortKey() == section) DrawArrow(*painter, rect);

  const QPixmap icon = model_.HeaderIcon(section);
  if (!icon.isNull()) {
    const QSizeF size = icon.deviceIndependentSize() * scale_.zoom;
    const QSizeF fitted =
        size.scaled(QSizeF(rect.size()) - QSizeF(4, 8), Qt::KeepAspectRatio).boundedTo(size);
    QRectF place(QPointF(), fitted);
    place.moveCenter(QRectF(rect).center());
    painter->setRenderHint(QPainter::SmoothPixmapTransform);
    painter->drawPixmap(place, icon, QRectF(QPointF(), QSizeF(icon.size())));
  }
  const QString text = ShownText(column.caption);
  painter->setPen(ToQColor(Palette::QuietInk));
  painter->setLayoutDirection(ToQt(DirectionOf(column.caption)));
  const int padding = scale_.Pixels(8);
  painter->drawText(rect.adjusted(padding, 0, -padding, 0),
                    static_cast<int>(ToQt(SideOf(column.alignment, direction_)) | Qt::AlignVCenter) |
                        Qt::TextSingleLine,
                    text);
  painter->restore();
}

void ListHeader::DrawArrow(QPainter& painter, const QRect& rect) const {
  const int inset = scale_.Pixels(14);
  const double x = direction_ == Direction::RightToLeft ? rect.left() + inset : rect.right() - inset;
  const double y = rect.center().y() + 1;
  const double tip = model_.List()->Order() == SortOrder::Ascending ? -2.5 : 2.5;
  painter.setRenderHint(QPainter::Antialiasing);
  const QPen pen = painter.pen();
  painter.setPen(Qt::NoPen);
  painter.setBrush(ToQColor(Palette::QuietInk));
  painter.drawPolygon(QPolygonF({{x - 4, y - tip}, {x + 4, y - tip}, {x, y + tip}}));
  painter.setPen(pen);
}

} // namespace quendra::forms::qt
