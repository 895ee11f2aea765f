#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// A straight line from (x1, y1) to (x2, y2), in twips in its container.
struct LineEnds {
  int x1 = 0;
  int y1 = 0;
  int x2 = 0;
  int y2 = 0;
  friend bool operator==(const LineEnds&, const LineEnds&) = default;
};

class Line : public Control {
 public:
  using Control::Control;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<LineEnds, Aspect::Geometry> Ends{*this};
  Property<int, Aspect::Look> BorderWidth{*this, 1}; ///< pixels
};

} // namespace quendra::forms
