#pragma once

#include "winapi/Winapi.h"

namespace quendra::forms::win32 {

HINSTANCE ThisProgram();

/// Gives the name of a class of windows that answer by this procedure, registered where it isn't yet.
const wchar_t* OwnClass(const wchar_t* name, WNDPROC procedure, UINT style = 0);

} // namespace quendra::forms::win32
