#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// A group of controls with a caption on its border; without a caption and border it is a plain page.
class Frame : public Container {
 public:
  using Container::Container;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<Text, Aspect::Caption> Caption{*this};
  Property<bool, Aspect::Look> Border{*this, true};
};

} // namespace quendra::forms
