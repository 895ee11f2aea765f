#pragma once

#include "forms/controls/Control.h"
#include "forms/controls/Picture.h"

namespace quendra::forms {

/// A picture without a drawing surface, stretched to its size.
class Image : public Control {
 public:
  using Control::Control;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<Picture, Aspect::Picture> Contents{*this};
};

} // namespace quendra::forms
