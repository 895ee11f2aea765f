#pragma once

#include "forms/controls/Control.h"
#include "forms/controls/Picture.h"

namespace quendra::forms {

/// The unit of the drawing operations, as it is published. Geometry stays in twips.
enum class ScaleMode { Twips = 1, Pixels = 3 };

/// A picture with a drawing surface; holds other controls too. Drawing goes through a Canvas.
class PictureBox : public Container {
 public:
  using Container::Container;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<Picture, Aspect::Picture> Contents{*this};
  Property<bool, Aspect::Look> Border{*this, false};
  forms::ScaleMode ScaleMode = forms::ScaleMode::Twips;
  /// Where the next print goes, in the unit of ScaleMode.
  int CurrentX = 0;
  int CurrentY = 0;
};

} // namespace quendra::forms
