#pragma once

#include "runtime/Text.h"

namespace quendra::forms::win32 {

// An EDIT window gives all its lines one direction, and some systems read all from the left. A sign without
// width at a line's begin, which the window knows as one that it doesn't show, has the line read in the
// direction of its own first letter. It holds for the first row of a line that is too long for one.

/// Lines with a line feed between them, and the signs that they need. Lines from left to right need one among
/// others, in a text that begins from right to left.
Text WithLineMarks(TextView lines);
bool IsLineMark(char16_t unit);
Text WithoutLineMarks(TextView lines);

} // namespace quendra::forms::win32
