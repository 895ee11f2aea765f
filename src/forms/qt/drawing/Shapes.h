#pragma once

#include "forms/view/RoundRect.h"

#include <QRegion>

namespace quendra::forms::qt {

/// Ellipses wider or higher than the rectangle are cut to it.
QRegion RegionOf(const RoundRect& shape);

} // namespace quendra::forms::qt
