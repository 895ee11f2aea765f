#include "forms/qt/drawing/Shapes.h"

#include <algorithm>

namespace quendra::forms::qt {

QRegion RegionOf(const RoundRect& shape) {
  const auto& [left, top, right, bottom, ellipseWidth, ellipseHeight] = shape;
  const QRect box(QPoint(std::min(left, right), std::min(top, bottom)),
                  QPoint(std::max(left, right) - 1, std::max(top, bottom) - 1));
  const int width = std::clamp(ellipseWidth, 0, box.width());
  const int height = std::clamp(ellipseHeight, 0, box.height());
  if (box.isEmpty() || width == 0 || height == 0) return box;
  QRegion region(box.adjusted(width / 2, 0, -(width / 2), 0));
  region += box.adjusted(0, height / 2, 0, -(height / 2));
  const QRect ellipse(0, 0, width, height);
  for (const int x : {box.left(), box.right() + 1 - width})
    for (const int y : {box.top(), box.bottom() + 1 - height})
      region += QRegion(ellipse.translated(x, y), QRegion::Ellipse);
  return region;
}

} // namespace quendra::forms::qt
