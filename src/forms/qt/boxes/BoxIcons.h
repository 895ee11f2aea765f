#pragma once

#include <QPixmap>

namespace quendra::forms::qt {

/// The sign of a message box by its flags (kCritical, kExclamation or kInformation); null for any other.
QPixmap BoxIcon(int flags, int side, qreal pixelRatio);

} // namespace quendra::forms::qt
