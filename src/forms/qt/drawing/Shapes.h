#pragma once

#include <QRegion>

namespace quendra::forms::qt {

/// A rectangle with rounded corners, in pixels; right and bottom lie outside.
struct RoundRect {
  int left = 0;
  int top = 0;
  int right = 0;
  int bottom = 0;
  int ellipseWidth = 0;
  int ellipseHeight = 0;

  RoundRect Zoomed(double factor) const;
};

/// Ellipses wider or higher than the rectangle are cut to it.
QRegion RegionOf(const RoundRect& shape);

} // namespace quendra::forms::qt
