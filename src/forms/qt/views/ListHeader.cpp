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
  return {QHeaderView::sizeHint().width(), Look().HeaderHeight(fontMetrics().height())};
}

void ListHeader::paintSection(QPainter* painter, const QRect& rect, int section) const {
  if (rect.width() <= 0 || section >= model_.columnCount()) return;
  const Area header = ToArea(rect);
  painter->save();
  painter->fillRect(rect, ToQColor(Palette::QuietPage));
  painter->setPen(ToQColor(Palette::Border));
  // Filled: at a scale of the screen a line ends short of its last pixel.
  painter->fillRect(ToQRect(ListLook::HeaderEdge(header)), ToQColor(Palette::Border));
  const QRect divider = ToQRect(Look().Divider(header));
  painter->drawLine(divider.topLeft(), divider.bottomLeft());
  if (ShowsArrow(*model_.List(), section)) DrawArrow(*painter, header);
  DrawIcon(*painter, header, model_.HeaderIcon(section));
  DrawCaption(*painter, header, model_.List()->Columns()[static_cast<std::size_t>(section)]);
  painter->restore();
}

void ListHeader::DrawIcon(QPainter& painter, const Area& header, const QPixmap& icon) const {
  if (icon.isNull()) return;
  const QSizeF size = icon.deviceIndependentSize();
  QRectF place(QPointF(), size * Look().IconShare(size.width(), size.height(), header));
  place.moveCenter(QRectF(ToQRect(header)).center());
  painter.setRenderHint(QPainter::SmoothPixmapTransform);
  painter.drawPixmap(place, icon, QRectF(QPointF(), QSizeF(icon.size())));
}

void ListHeader::DrawCaption(QPainter& painter, const Area& header, const ColumnHeader& column) const {
  const Text caption = VisibleText(column.caption);
  painter.setPen(ToQColor(Palette::QuietInk));
  painter.setLayoutDirection(ToQt(DirectionOf(caption)));
  const auto side = ToQt(Look().SideOf(column.alignment));
  painter.drawText(ToQRect(Look().HeaderTextPlace(header)),
                   static_cast<int>(side | Qt::AlignVCenter) | Qt::TextSingleLine, ToQString(caption));
}

void ListHeader::DrawArrow(QPainter& painter, const Area& header) const {
  QPolygonF corners;
  for (const auto& [x, y] : Look().Arrow(header, model_.List()->Order())) corners << QPointF(x, y);
  painter.setRenderHint(QPainter::Antialiasing);
  const QPen pen = painter.pen();
  painter.setPen(Qt::NoPen);
  painter.setBrush(ToQColor(Palette::QuietInk));
  painter.drawPolygon(corners);
  painter.setPen(pen);
}

} // namespace quendra::forms::qt
