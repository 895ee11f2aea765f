#pragma once

#include "runtime/Text.h"
#include "winapi/Winapi.h"

namespace quendra::forms::win32 {

/// Gives the clipboard to a window of ours, with a text. Nothing where another program holds it open.
void PutOnClipboard(HWND owner, const Text& text);

} // namespace quendra::forms::win32
