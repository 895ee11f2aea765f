#pragma once

#include "forms/view/Keyboard.h"

namespace quendra::forms {

enum class TabDirection { Forwards, Backwards };

/// Where the Tab key moves the focus from a control (nullptr for none): to the next in the form's order that
/// is there to take it and in sight, and after the last to the first. The control itself where it is the only
/// one, nullptr where there is none.
Control* NextFocus(const Form& form, const Control* focused, TabDirection direction);

} // namespace quendra::forms
