#include "forms/qt/boxes/BoxIcons.h"

#include <QPainter>
#include <QPainterPath>

namespace quendra::forms::qt {

namespace {

// All signs are drawn on a square of 40.

void DrawCross(QPainter& painter) {
  painter.setBrush(QColor(0xC6, 0x28, 0x28));
  painter.drawEllipse(2, 2, 36, 36);
  painter.setPen(QPen(Qt::white, 4, Qt::SolidLine, Qt::RoundCap));
  painter.drawLine(14, 14, 26, 26);
  painter.drawLine(26, 14, 14, 26);
}

void DrawWarning(QPainter& painter) {
  QPainterPath triangle(QPointF(20, 5));
  triangle.lineTo(37, 35);
  triangle.lineTo(3, 35);
  triangle.closeSubpath();
  const QColor amber(0xF2, 0xA9, 0x1C);
  painter.setBrush(amber);
  painter.setPen(QPen(amber, 4, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
  painter.drawPath(triangle);
  painter.setPen(QPen(Qt::white, 4, Qt::SolidLine, Qt::RoundCap));
  painter.drawLine(20, 15, 20, 23);
  painter.drawPoint(20, 30);
}

void DrawQuestion(QPainter& painter) {
  painter.setBrush(QColor(0x1B, 0x6E, 0xC2));
  painter.drawEllipse(2, 2, 36, 36);
  painter.setBrush(Qt::NoBrush);
  painter.setPen(QPen(Qt::white, 4, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
  // A hook of three quarters of a circle, its stem and the dot.
  QPainterPath mark;
  mark.arcMoveTo(14, 9, 12, 12, 170);
  mark.arcTo(14, 9, 12, 12, 170, -230);
  mark.lineTo(20, 24);
  painter.drawPath(mark);
  painter.drawPoint(20, 30);
}

void DrawInformation(QPainter& painter) {
  painter.setBrush(QColor(0x1B, 0x6E, 0xC2));
  painter.drawEllipse(2, 2, 36, 36);
  painter.setPen(QPen(Qt::white, 4, Qt::SolidLine, Qt::RoundCap));
  painter.drawPoint(20, 12);
  painter.drawLine(20, 19, 20, 28);
}

} // namespace

QPixmap BoxIcon(BoxSign sign, int side, qreal pixelRatio) {
  if (sign == BoxSign::None) return {};
  QPixmap icon(QSize(side, side) * pixelRatio);
  icon.setDevicePixelRatio(pixelRatio);
  icon.fill(Qt::transparent);
  QPainter painter(&icon);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.scale(side / 40.0, side / 40.0);
  painter.setPen(Qt::NoPen);
  if (sign == BoxSign::Critical) DrawCross(painter);
  if (sign == BoxSign::Question) DrawQuestion(painter);
  if (sign == BoxSign::Exclamation) DrawWarning(painter);
  if (sign == BoxSign::Information) DrawInformation(painter);
  return icon;
}

} // namespace quendra::forms::qt
