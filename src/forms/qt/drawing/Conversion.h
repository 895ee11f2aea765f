#pragma once

#include "forms/controls/Colour.h"
#include "forms/controls/Control.h"
#include "forms/view/ControlPlacement.h"
#include "forms/view/VisibleText.h"

#include <QColor>
#include <QFont>
#include <QRect>
#include <QString>

namespace quendra::forms::qt {

inline QString ToQString(TextView text) {
  return QString::fromUtf16(text.data(), static_cast<qsizetype>(text.size()));
}
inline Text ToText(const QString& text) { return text.toStdU16String(); }
inline QColor ToQColor(Colour colour) {
  return QColor(static_cast<int>(colour & 0xFF), static_cast<int>(colour >> 8 & 0xFF),
                static_cast<int>(colour >> 16 & 0xFF));
}
inline QRect ToQRect(const Area& area) {
  return {area.corner.left, area.corner.top, area.extent.width, area.extent.height};
}
inline Extent ToExtent(QSize size) { return {size.width(), size.height()}; }
inline Area ToArea(const QRect& area) { return {{area.x(), area.y()}, ToExtent(area.size())}; }
inline Spot ToSpot(QPoint point) { return {point.x(), point.y()}; }
inline QPoint ToQPoint(Spot spot) { return {spot.left, spot.top}; }
QFont ToQFont(const Font& font, const Scale& scale = {});

inline Qt::LayoutDirection ToQt(Direction direction) {
  return direction == Direction::RightToLeft ? Qt::RightToLeft : Qt::LeftToRight;
}
Qt::Alignment ToQt(Side side);

/// VisibleText as the toolkit takes it.
inline QString ShownText(TextView text, LineBreaks lineBreaks = LineBreaks::Show) {
  return ToQString(VisibleText(text, lineBreaks));
}

} // namespace quendra::forms::qt
