#pragma once

#include "forms/controls/TextEntry.h"

namespace quendra::forms {

/// A field for text, of one line or of many.
class TextBox : public Control, public TextEntry {
 public:
  TextBox(Container& parent, Text name)
      : Control(parent, std::move(name)), TextEntry(*static_cast<Control*>(this)) {}
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  bool TakesFocus() const override { return true; }

  /// Of many lines. Read when the form is loaded.
  bool MultiLine = false;
  /// The user can read, select and copy, and change nothing.
  Property<bool, Aspect::Look> ReadOnly{*this, false};
  /// On a field of a single line: each character shows as the same sign, and assistive technology doesn't
  /// read it.
  Property<bool, Aspect::Look> Masked{*this, false};
  /// On a field of many lines: always there, else never.
  Property<bool, Aspect::Look> VerticalScrollBar{*this, false};
  /// In letters that are all as wide.
  Property<bool, Aspect::Font> Monospaced{*this, false};
};

} // namespace quendra::forms
