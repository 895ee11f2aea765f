#pragma once

#include "forms/view/BoxContent.h"
#include "forms/win32/windows/FormWindow.h"

namespace quendra::forms::win32 {

/// Shows a message box over a window (nullptr for none) and waits for its answer, the number of the pressed
/// button.
int ShowBox(const ViewContext& desktops, FormWindow* owner, const BoxContent& content, const Waiter& wait);

} // namespace quendra::forms::win32
