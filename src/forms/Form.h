#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

class FormHost;

enum class BorderStyle { None, FixedSingle, FixedDialog, Sizable };

/// State of the modifier keys in key and mouse events.
enum ShiftState : int { kNoShift = 0, kShift = 1, kCtrl = 2, kAlt = 4 };

/// A form: a plain object whose members are its controls. Its life is Load, then shown, then Unload, and
/// again. `Position` holds the client area's size; its left and top are not used, forms are centred on the
/// screen.
class Form : public Container {
 public:
  explicit Form(Text name) : Container(std::move(name)) { Visible = false; }

  /// Nothing: a form stands in no container, visits start with what it holds.
  void Accept(ControlVisitor& /*visitor*/) override {}

  Property<Text, Aspect::Caption> Caption{*this};
  BorderStyle Border = BorderStyle::FixedSingle;
  bool MinimizeBox = true;
  bool MaximizeBox = false;
  bool RightToLeft = true;
  /// Keys reach the form before the control that has the focus.
  bool KeyPreview = false;
  /// Clicked by Enter where the control that has the focus doesn't take it, nullptr for none.
  Control* Default = nullptr;
  /// Clicked by Escape, nullptr for none.
  Control* Cancel = nullptr;

  /// Puts every control into its state of design time. Run at each load, before Form_Load.
  virtual void Design() = 0;
  virtual void Form_Load() {}
  virtual void Form_Unload() {}
  virtual void Form_Activate() {}
  virtual void Form_Deactivate() {}
  /// `keyCode` is the code of the character that the key gives without modifiers in the active layout, as
  /// upper case for Latin letters; `shift` is a sum of ShiftState.
  virtual void Form_KeyDown(int /*keyCode*/, int /*shift*/) {}

  bool IsLoaded() const { return loaded_; }

 private:
  friend class FormHost;
  bool loaded_ = false;
  bool unloading_ = false;
};

} // namespace quendra::forms
