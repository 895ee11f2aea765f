#pragma once

#include "forms/Form.h"

namespace quendra::forms {

/// The codes of named keys, as the platform numbers them.
enum NamedKey : int { kEnterKey = 13, kEscapeKey = 27 };

/// All controls of a form in the order in which the Tab key finds those that take the focus: by TabIndex,
/// then as they stand in the form.
std::vector<Control*> TabOrder(const Form& form);

/// The control that has the focus when the form comes up; nullptr when none can take it.
Control* FirstFocus(const Form& form);

/// The control that a key clicks when no control took it for itself: the form's Default for Enter and its
/// Cancel for Escape, without modifiers. nullptr for any other key, or where that control isn't there to be
/// clicked.
Control* ControlPressedBy(const Form& form, int keyCode, int shift);

} // namespace quendra::forms
