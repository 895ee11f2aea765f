#pragma once

#include "forms/win32/views/InnerWindow.h"

namespace quendra::forms::win32 {

/// What an EDIT window holds, with the marks of its lines.
Text HeldIn(const InnerWindow& edit);
/// From one place of what it holds to another.
std::pair<int, int> HeldSelectionIn(const InnerWindow& edit);

/// What other programs and the clipboard get of a window whose lines have marks: the text without them. None
/// for messages that ask for nothing of it.
std::optional<LRESULT> AnswerWithoutMarks(const InnerWindow& edit, UINT message, WPARAM wParam,
                                          LPARAM lParam);

} // namespace quendra::forms::win32
