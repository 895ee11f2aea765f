#include "forms/qt/views/ImageView.h"

#include <QPainter>

namespace quendra::forms::qt {

void DrawStretched(QPainter& painter, const QRect& rectangle, const QPixmap& pixmap) {
  if (pixmap.isNull()) return;
  painter.setRenderHint(QPainter::SmoothPixmapTransform,
                        pixmap.deviceIndependentSize() != QSizeF(rectangle.size()));
  painter.drawPixmap(rectangle, pixmap);
}

ImageView::ImageView(ViewContext& context, Image& image, QWidget* parent)
    : QWidget(parent), WidgetView(context, image, *this) {}

void ImageView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  QPainter painter(this);
  DrawStretched(painter, rect(),
                Context().pictures.PixmapOf(static_cast<const Image&>(*TheControl()).Contents()));
}

} // namespace quendra::forms::qt
