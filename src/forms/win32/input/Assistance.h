#pragma once

#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

/// What assistive technology asks of a window that we draw. The system's own proxies speak for one that tells
/// them of which of the system's kinds it is: a button by the window's text and BM_CLICK.
std::optional<LRESULT> AnswerAssistance(WindowView& view, UINT message, LPARAM lParam);

} // namespace quendra::forms::win32
