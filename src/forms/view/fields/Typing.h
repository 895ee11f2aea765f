#pragma once

#include "forms/Form.h"
#include "forms/controls/TextEntry.h"
#include "forms/view/Keyboard.h"

namespace quendra::forms {

/// What a character that was typed does in a field.
struct Typing {
  enum class Act {
    Nothing,
    Insert,
    DeleteBack, ///< what a backspace does
    Command,    ///< no text: the toolkit may have a use for it, as for the character of Ctrl and C
  };
  Act act = Act::Nothing;
  Text text{}; ///< to be inserted
  friend bool operator==(const Typing&, const Typing&) = default;
};

/// What is typed into in this control: nullptr for one without a field.
TextEntry* FieldOf(Control& control);

/// Whether a key that gives a character is one for the field that has the focus. Tab moves the focus, Alt
/// belongs to menus, and Enter and Escape press the form's Default and Cancel where it has them.
bool IsTyped(const Form& form, const KeyPress& key);

/// Asks the field's handler about a character, by its number in Unicode. Control characters get into no text;
/// in a field of many lines Enter begins the next one.
Typing Type(TextEntry& entry, int character, bool ofManyLines);

/// Where the word begins that ends at a place, with the blanks behind it: up to there Ctrl and the backspace
/// delete. Signs side by side are a word too, and so is a line break.
int WordStart(TextView text, int place);

} // namespace quendra::forms
