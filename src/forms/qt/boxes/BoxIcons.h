#pragma once

#include "forms/view/BoxContent.h"

#include <QPixmap>

namespace quendra::forms::qt {

/// The sign of a message box as a picture; null for none.
QPixmap BoxIcon(BoxSign sign, int side, qreal pixelRatio);

} // namespace quendra::forms::qt
