#pragma once

#include "forms/view/Area.h"

namespace quendra::forms {

// How large a form is shown and where its window comes to lie. All numbers are pixels of the screen.

/// Below this nobody reads the letters any more.
inline constexpr double kLeastScale = 0.7;

struct Fitting {
  /// Of everything in the form: its lengths and its letters.
  double scale = 1;
  /// The form is larger than its window even so, which shows a part of it.
  bool scrolls = false;
};

/// The scale that brings a form of this extent into the room that a window has for its inside. No form is
/// shown larger than it was laid out.
Fitting FittingScale(Extent form, Extent room);

/// The inside of the window of a form that takes `shown` pixels at its scale: the same, or what room there
/// is, with a scroll bar of `scrollBar` pixels beside what doesn't fit.
Extent WindowExtent(Extent shown, Extent room, int scrollBar);

/// The corner of a window, its frame included, in the middle of what it stands over, yet on the screen.
Spot CornerOver(Extent window, Area over, Area screen);

/// The corner that brings a window, its frame included, on the screen by the shortest way. One that is larger
/// than the screen shows its title bar.
Spot CornerOnScreen(Area window, Area screen);

} // namespace quendra::forms
