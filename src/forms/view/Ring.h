#pragma once

#include "forms/controls/Colour.h"

namespace quendra::forms {

/// A line of the ring round the control that has the focus, in pixels.
struct Ring {
  double inset = 0; ///< its middle, from the edge of what it goes round
  int width = 0;
  int corner = 0; ///< how round its corners are
  Colour colour = kBlack;
};

} // namespace quendra::forms
