#pragma once

#include "forms/controls/ComputedProperty.h"
#include "forms/controls/Control.h"

namespace quendra::forms {

/// What a control has into which the user types: a text, with a line break of two characters (13 and 10)
/// between lines, the caret and the selection in it. Places are code units from 0.
class TextEntry {
 public:
  explicit TextEntry(Control& owner) : owner_(owner) {}
  virtual ~TextEntry() = default;
  TextEntry(const TextEntry&) = delete;
  TextEntry& operator=(const TextEntry&) = delete;

 private:
  const Text& ReadText() const { return text_; }
  void WriteText(Text text);
  const int& ReadStart() const { return start_; }
  void WriteStart(int start) { Select(start, 0); }
  const int& ReadLength() const { return length_; }
  void WriteLength(int length) { Select(start_, length); }

 public:
  /// The text. Writing another one puts the caret at its start and raises Change.
  ComputedProperty<TextEntry, Text, &TextEntry::ReadText, &TextEntry::WriteText> Value{*this};
  /// Where the selection begins; without one, the caret. Writing it ends the selection. What lies beyond the
  /// text counts as its end.
  ComputedProperty<TextEntry, int, &TextEntry::ReadStart, &TextEntry::WriteStart> SelStart{*this};
  ComputedProperty<TextEntry, int, &TextEntry::ReadLength, &TextEntry::WriteLength> SelLength{*this};

  /// The text is another one now, by whomever.
  Event<> Change;
  /// The focus came from elsewhere in the program.
  Event<> GotFocus;
  /// A key that gives a character: its number in Unicode. What the handler leaves there is typed instead; 0
  /// swallows the key.
  Event<int&> KeyPress;

  /// What assistive technology says of the field. Empty where a label before it says that.
  Text Description;

  // What views tell.

  /// The user has edited the text, as the view shows already; the caret stands at `caret`.
  void Edited(Text text, int caret);
  /// The user has moved the caret or selected, as the view shows already.
  void Selected(int start, int length);

 protected:
  /// False for a control that takes no text of this kind now.
  virtual bool TakesText() const { return true; }
  /// The text is not what it was any more.
  virtual void TextChanged() {}
  /// Another text, of which the view and the handlers hear in another way.
  void ReplaceText(Text text);

 private:
  void Select(int start, int length);
  void Keep(int start, int length);

  Control& owner_;
  Text text_;
  int start_ = 0;
  int length_ = 0;
};

} // namespace quendra::forms
