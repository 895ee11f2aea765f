#pragma once

#include "forms/Desktop.h"

class QWidget;

namespace quendra::forms::qt {

/// Shows a message box over `owner` (nullptr for none) and waits for its answer, the number of the pressed
/// button.
int ShowBox(QWidget* owner, const Text& text, int flags, const Text& title);

} // namespace quendra::forms::qt
