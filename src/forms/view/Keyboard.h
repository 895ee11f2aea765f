#pragma once

#include "forms/Form.h"
#include "forms/controls/Label.h"
#include "forms/controls/ListBox.h"

#include <optional>

namespace quendra::forms {

/// The codes of named keys, as the platform numbers them.
enum NamedKey : int {
  kBackspaceKey = 8,
  kTabKey = 9,
  kEnterKey = 13,
  kEscapeKey = 27,
  kSpaceKey = 32,
  kPageUpKey = 33,
  kPageDownKey = 34,
  kEndKey = 35,
  kHomeKey = 36,
  kLeftKey = 37,
  kUpKey = 38,
  kRightKey = 39,
  kDownKey = 40,
  kInsertKey = 45,
  kDeleteKey = 46,
  kF1Key = 112,
};

/// The code of the key that gives this character without modifiers: the character itself, Latin letters as
/// upper case.
int CodeOfCharacter(char16_t character);

/// The state of the modifier keys as handlers get it, a sum of ShiftState.
constexpr int ShiftSum(bool shift, bool ctrl, bool alt) {
  return (shift ? kShift : 0) | (ctrl ? kCtrl : 0) | (alt ? kAlt : 0);
}

/// One press of a key, or one of those that a held key gives.
struct KeyPress {
  int code = 0; ///< 0 for a key without one
  int shift = kNoShift;
  bool repeated = false;
};

/// All controls of a form in the order in which the Tab key finds those that take the focus: by TabIndex,
/// then as they stand in the form.
std::vector<Control*> TabOrder(const Form& form);

/// The control that has the focus when the form comes up; nullptr when none can take it.
Control* FirstFocus(const Form& form);

/// Whether the form hears of a key. One without a preview hears of those alone that come to no control.
bool HearsOf(const Form& form, const KeyPress& key, bool aControlHasFocus);

/// Whether the key presses the label that has the focus. A key held down is one press.
bool PressesLabel(const Label& label, const KeyPress& key);

/// The item of a list box that a key goes to from the selected one: Up, Down, Home and End, without
/// modifiers. None for any other key and in an empty list.
std::optional<int> ItemReachedBy(const ListBox& list, const KeyPress& key);

/// Whether a list leaves the key to its form: Ctrl or Alt and a character, which would else search its rows.
bool PassesList(int shift, bool givesCharacter);

/// The control that a key clicks when no control took it for itself: the form's Default for Enter and its
/// Cancel for Escape, without modifiers. nullptr for any other key, or where that control isn't there to be
/// clicked.
Control* ControlPressedBy(const Form& form, int keyCode, int shift);
/// The same for a key that may be held down, which is one press: what it closes may lie on something else
/// that it would close next.
Control* ControlPressedBy(const Form& form, const KeyPress& key);

} // namespace quendra::forms
