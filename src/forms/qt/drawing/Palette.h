#pragma once

#include <QColor>

class QApplication;

namespace quendra::forms::qt {

/// The few colours of the house beside those that the forms name themselves.
namespace palette {
inline const QColor kInk(0x1F, 0x29, 0x33);
inline const QColor kQuietInk(0x6B, 0x77, 0x85);
inline const QColor kPage(0xFF, 0xFF, 0xFF);
inline const QColor kQuietPage(0xF6, 0xF8, 0xF9);
inline const QColor kBorder(0xD5, 0xDB, 0xE1);
inline const QColor kStrongBorder(0xB4, 0xBE, 0xC8);
inline const QColor kLink(0x0B, 0x5F, 0xA5);
inline const QColor kSelection(0xDD, 0xF3, 0xC8);
inline const QColor kFocus(0x1B, 0x6E, 0xC2);
} // namespace palette

/// Style, palette, font and reading direction of the whole program.
void DressApplication(QApplication& application);

} // namespace quendra::forms::qt
