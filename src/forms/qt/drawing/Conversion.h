#pragma once

#include "forms/controls/Colour.h"
#include "forms/controls/Control.h"
#include "forms/controls/Controls.h"
#include "runtime/Text.h"

#include <QColor>
#include <QFont>
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
QFont ToQFont(const Font& font, double zoom = 1);

enum class LineBreaks { Keep, Show };

/// The text as it can be shown without harm: control characters, direction marks and broken code units become
/// visible signs, and what goes beyond `limit` code units is cut with an ellipsis. Line breaks stay or are
/// made visible too.
QString VisibleText(TextView text, LineBreaks lineBreaks = LineBreaks::Show, qsizetype limit = 1024);

/// Right to left for a text that holds Hebrew, left to right for any other: addresses, paths and names keep
/// their order.
Qt::LayoutDirection DirectionOf(QStringView text);
/// The text set apart from its surroundings when it reads from left to right, for widgets that lay out by
/// themselves.
QString Isolated(const QString& text);

/// The side that an alignment means in a form that reads in this direction.
Qt::Alignment SideOf(Alignment alignment, bool rightToLeft);

} // namespace quendra::forms::qt
