#include "forms/qt/drawing/Conversion.h"

namespace quendra::forms::qt {

QFont ToQFont(const Font& font, const Scale& scale) {
  QFont result;
  result.setPointSizeF(scale.Points(font.size));
  result.setBold(font.bold);
  result.setUnderline(font.underline);
  return result;
}

Qt::Alignment ToQt(Side side) {
  switch (side) {
  case Side::Left: return Qt::AlignLeft | Qt::AlignAbsolute;
  case Side::Right: return Qt::AlignRight | Qt::AlignAbsolute;
  case Side::Middle: break;
  }
  return Qt::AlignHCenter;
}

} // namespace quendra::forms::qt
