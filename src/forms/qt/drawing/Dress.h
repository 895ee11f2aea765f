#pragma once

class QApplication;

namespace quendra::forms::qt {

/// Style, palette, font and reading direction of the whole program.
void DressApplication(QApplication& application);

} // namespace quendra::forms::qt
