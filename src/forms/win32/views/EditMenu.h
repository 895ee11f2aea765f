#pragma once

#include "winapi/Winapi.h"

namespace quendra::forms::win32 {

/// The menu of an EDIT window, in the language of the program, and what is chosen from it. `place` is that of
/// WM_CONTEXTMENU: a point of the screen, or -1 for the caret when it came by a key.
void ShowEditMenu(HWND edit, LPARAM place);

} // namespace quendra::forms::win32
