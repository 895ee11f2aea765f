#pragma once

#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

/// Answers WM_PAINT of a window that stands for a control or a form. What of the form is due there is put
/// together from its ground and all controls that have a part in it, those that lie below first, and the
/// window's own part shown at once.
void PaintWindow(const WindowView& view);

} // namespace quendra::forms::win32
