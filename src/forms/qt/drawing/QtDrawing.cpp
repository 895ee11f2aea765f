#include "forms/qt/drawing/QtDrawing.h"

#include "forms/qt/drawing/ImageDecoder.h"
#include "forms/view/DrawingUnits.h"

#include <QPainter>

#include <cmath>

namespace quendra::forms::qt {

namespace {

PictureBoxView* ViewOf(const PictureBox& box) { return static_cast<PictureBoxView*>(box.View()); }

QFontMetrics MetricsOf(const PictureBox& box) { return QFontMetrics(ToQFont(box.TextFont())); }

} // namespace

int QtDrawing::WidthInPixels(const PictureBox& box, TextView text) const {
  return MetricsOf(box).horizontalAdvance(ShownText(text));
}

int QtDrawing::LineHeight(const PictureBox& box) const { return MetricsOf(box).height(); }

void QtDrawing::DropDrawings(PictureBox& box) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return;
  view->ClearSurface();
  view->update();
}

void QtDrawing::FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return;
  const Area filled = DrawingUnits(box, scale_).FilledBox(x1, y1, x2, y2);
  QPainter(&view->Surface()).fillRect(ToQRect(filled), ToQColor(colour));
}

void QtDrawing::PrintLine(PictureBox& box, TextView text, const Area& place) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return;
  const Direction direction = DirectionOf(box.OwnerForm());
  QPainter painter(&view->Surface());
  painter.setFont(ToQFont(box.TextFont()));
  painter.setPen(ToQColor(box.ForeColour()));
  painter.setLayoutDirection(ToQt(direction));
  const auto side = static_cast<int>(ToQt(SideOf(Alignment::Leading, direction)));
  painter.drawText(ToQRect(place), side | Qt::AlignTop | Qt::TextSingleLine | Qt::TextDontClip,
                   ShownText(text));
}

void QtDrawing::BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source,
                       int sourceX, int sourceY) {
  PictureBoxView* to = ViewOf(target);
  const PictureBoxView* from = ViewOf(source);
  if (!to || !from || to == from) return;
  QPainter painter(&to->Surface());
  painter.translate(x - sourceX, y - sourceY);
  // What lies outside the source has nothing to give: its layers end with it.
  painter.setClipRect(sourceX, sourceY, width, height);
  from->PaintLayers(painter, from->LaidOutSize(), PictureBoxView::Ground::Drawn);
}

void QtDrawing::Refresh(PictureBox& box) {
  if (PictureBoxView* view = ViewOf(box)) view->update();
}

bool QtDrawing::DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                           int height) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return false;
  const int ratio = static_cast<int>(std::ceil(view->devicePixelRatioF()));
  const QImage icon = DecodeIcon(image, QSize(width, height) * ratio);
  if (icon.isNull()) return false;
  const QSizeF size = QSizeF(icon.size()) / ratio;
  const DrawingUnits units(box, scale_);
  const QPointF corner(units.PixelsX(x) + (width - size.width()) / 2,
                       units.PixelsY(y) + (height - size.height()) / 2);
  QPainter(&view->Surface()).drawImage(QRectF(corner, size), icon);
  return true;
}

Picture QtDrawing::ImageOf(const PictureBox& box) const {
  const PictureBoxView* view = ViewOf(box);
  if (!view) return box.Contents();
  QImage image(view->LaidOutSize().expandedTo({1, 1}) * view->devicePixelRatioF(),
               QImage::Format_ARGB32_Premultiplied);
  image.setDevicePixelRatio(view->devicePixelRatioF());
  image.fill(Qt::transparent);
  QPainter painter(&image);
  // Without the ground colour: an icon drawn in a box then sits well on a selected row, too.
  view->PaintLayers(painter, view->LaidOutSize(), PictureBoxView::Ground::SeeThrough);
  painter.end();
  return PictureStore::PictureOf(image);
}

} // namespace quendra::forms::qt
