#pragma once

#include "forms/controls/Alignment.h"
#include "forms/controls/Control.h"

namespace quendra::forms {

/// A text. One with a Click handler or a button's face acts as a button: it takes the focus and Enter and
/// Space press it.
class Label : public Control {
 public:
  using Control::Control;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<Text, Aspect::Caption> Caption{*this};
  Property<Alignment, Aspect::Look> Align{*this, Alignment::Leading};
  Property<bool, Aspect::Look> Transparent{*this, true};
  Property<bool, Aspect::Look> WordWrap{*this, false};
  /// How a label that acts as a button is drawn: as plain text, a link, or a button with a face.
  enum class Look { Plain, Link, Button };
  Property<Look, Aspect::Look> Style{*this, Look::Plain};
  /// Clicked by the mouse alone: another control does the same for the keyboard and assistive technology.
  bool MouseOnly = false;
  bool IsButton() const { return !MouseOnly && (Click || Style() == Look::Button); }
  bool TakesFocus() const override { return IsButton(); }
  /// The accessible name where the caption is empty.
  Text Description;
};

} // namespace quendra::forms
