#pragma once

#include "forms/controls/Control.h"
#include "forms/controls/Picture.h"

namespace quendra::forms {

/// A picture with a drawing surface; holds other controls too. Drawing goes through Desktop.
class PictureBox : public Container {
 public:
  using Container::Container;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<Picture, Aspect::Picture> Contents{*this};
  Property<bool, Aspect::Look> Border{*this, false};
  /// 1 twips, 3 pixels: the unit of the drawing operations. Geometry stays in twips.
  int ScaleMode = 1;
  /// Where the next print goes, in the unit of ScaleMode.
  int CurrentX = 0;
  int CurrentY = 0;
};

} // namespace quendra::forms
