#include "forms/qt/drawing/QtDrawing.h"

#include "forms/qt/drawing/ImageDecoder.h"

#include <QPainter>

#include <algorithm>

namespace quendra::forms::qt {

namespace {

constexpr int kPixelMode = 3;
/// Pixels that text keeps off the right edge, which it would touch else.
constexpr int kEdge = 8;

PictureBoxView* ViewOf(const PictureBox& box) { return static_cast<PictureBoxView*>(box.View()); }

QFontMetrics MetricsOf(const PictureBox& box) { return QFontMetrics(ToQFont(box.TextFont())); }

bool ReadsFromRightToLeft(const PictureBox& box) {
  return const_cast<PictureBox&>(box).OwnerForm().RightToLeft;
}

} // namespace

int QtDrawing::PixelsX(const PictureBox& box, int units) const {
  return box.ScaleMode == kPixelMode ? units : scale_.PixelsX(units);
}

int QtDrawing::PixelsY(const PictureBox& box, int units) const {
  return box.ScaleMode == kPixelMode ? units : scale_.PixelsY(units);
}

int QtDrawing::UnitsX(const PictureBox& box, double pixels) const {
  return box.ScaleMode == kPixelMode ? static_cast<int>(std::ceil(pixels)) : scale_.TwipsX(pixels);
}

int QtDrawing::UnitsY(const PictureBox& box, double pixels) const {
  return box.ScaleMode == kPixelMode ? static_cast<int>(std::ceil(pixels)) : scale_.TwipsY(pixels);
}

int QtDrawing::ScaleWidth(const PictureBox& box) const {
  const int twips = box.Position().width;
  return box.ScaleMode == kPixelMode ? scale_.PixelsX(twips) : twips;
}

int QtDrawing::ScaleHeight(const PictureBox& box) const {
  const int twips = box.Position().height;
  return box.ScaleMode == kPixelMode ? scale_.PixelsY(twips) : twips;
}

int QtDrawing::TextWidth(const PictureBox& box, TextView text) const {
  return UnitsX(box, MetricsOf(box).horizontalAdvance(VisibleText(text)));
}

int QtDrawing::TextHeight(const PictureBox& box, TextView /*text*/) const {
  return UnitsY(box, MetricsOf(box).height());
}

void QtDrawing::Cls(PictureBox& box) {
  if (PictureBoxView* view = ViewOf(box)) {
    view->ClearSurface();
    view->update();
  }
  box.CurrentX = 0;
  box.CurrentY = 0;
}

void QtDrawing::FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return;
  const QPoint first(PixelsX(box, std::min(x1, x2)), PixelsY(box, std::min(y1, y2)));
  const QPoint last(PixelsX(box, std::max(x1, x2)), PixelsY(box, std::max(y1, y2)));
  QPainter(&view->Surface()).fillRect(QRect(first, last), ToQColor(colour));
}

void QtDrawing::Print(PictureBox& box, TextView text) {
  const int lineHeight = TextHeight(box, text);
  if (PictureBoxView* view = ViewOf(box)) {
    const QString line = VisibleText(text);
    const bool rightToLeft = ReadsFromRightToLeft(box);
    const int x = PixelsX(box, box.CurrentX) + (rightToLeft ? kEdge : 0);
    const int left = rightToLeft ? 0 : x;
    const QRect place(left, PixelsY(box, box.CurrentY), view->LaidOutSize().width() - x,
                      PixelsY(box, lineHeight));
    QPainter painter(&view->Surface());
    painter.setFont(ToQFont(box.TextFont()));
    painter.setPen(ToQColor(box.ForeColour()));
    painter.setLayoutDirection(rightToLeft ? Qt::RightToLeft : Qt::LeftToRight);
    const auto side = SideOf(Alignment::Leading, rightToLeft);
    painter.drawText(place, static_cast<int>(side) | Qt::AlignTop | Qt::TextSingleLine | Qt::TextDontClip,
                     line);
  }
  box.CurrentX = 0;
  box.CurrentY += lineHeight;
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
  const QPointF corner(PixelsX(box, x) + (width - size.width()) / 2,
                       PixelsY(box, y) + (height - size.height()) / 2);
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
