#include "forms/qt/views/PictureBoxView.h"

#include "forms/qt/views/FrameView.h"
#include "forms/qt/views/ImageView.h"
#include "forms/view/Palette.h"

#include <QPainter>

namespace quendra::forms::qt {

PictureBoxView::PictureBoxView(ViewContext& context, PictureBox& box, QWidget* parent)
    : QWidget(parent), WidgetView(context, box, *this) {
  setAttribute(Qt::WA_OpaquePaintEvent);
}

QSize PictureBoxView::LaidOutSize() const {
  if (!TheControl()) return {};
  const Extent extent = ExtentOf(Box().Position(), Context().scale.Unzoomed());
  return {extent.width, extent.height};
}

QSize PictureBoxView::SurfaceSize() const {
  return (QSizeF(LaidOutSize()) * devicePixelRatioF()).toSize().expandedTo({1, 1});
}

QImage& PictureBoxView::Surface() {
  if (surface_.isNull()) {
    surface_ = QImage(SurfaceSize(), QImage::Format_ARGB32_Premultiplied);
    surface_.setDevicePixelRatio(devicePixelRatioF());
    surface_.fill(Qt::transparent);
  }
  return surface_;
}

void PictureBoxView::Apply(Aspect aspect) {
  // A new size or picture drops the drawings, as the ground that they were made for is gone.
  if (Concerns(aspect, Aspect::Picture) || surface_.size() != SurfaceSize()) ClearSurface();
  if (Concerns(aspect, Aspect::Geometry)) PlaceChildren(Box());
}

void PictureBoxView::PaintLayers(QPainter& painter, QSize size, Ground ground) const {
  const QRect room(QPoint(), size);
  if (ground == Ground::Drawn) painter.fillRect(room, ToQColor(Box().BackColour()));
  DrawStretched(painter, room, Context().pictures.PixmapOf(Box().Contents()));
  if (surface_.isNull()) return;
  painter.setRenderHint(QPainter::SmoothPixmapTransform, size != LaidOutSize());
  painter.drawImage(room, surface_);
}

void PictureBoxView::paintEvent(QPaintEvent* /*event*/) {
  QPainter painter(this);
  if (!TheControl()) return;
  PaintLayers(painter, size(), Ground::Drawn);
  if (!Box().Border()) return;
  painter.setPen(ToQColor(Palette::Border));
  painter.drawRect(rect().adjusted(0, 0, -1, -1));
}

} // namespace quendra::forms::qt
