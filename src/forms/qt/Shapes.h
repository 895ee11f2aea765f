#pragma once

#include <QRegion>

namespace quendra::forms::qt {

/// A rectangle with rounded corners, in pixels; right and bottom lie outside. Ellipses wider or higher than
/// the rectangle are cut to it.
QRegion RoundedRegion(int left, int top, int right, int bottom, int ellipseWidth, int ellipseHeight);

} // namespace quendra::forms::qt
