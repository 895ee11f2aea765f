#pragma once

#include "forms/controls/Alignment.h"
#include "forms/controls/Line.h"
#include "forms/view/Area.h"
#include "forms/view/Direction.h"
#include "forms/view/Scale.h"

namespace quendra::forms {

// Where controls and what they show come to lie. Left and right are those of the screen.

/// How a form is read, and with it all that stands in it.
Direction DirectionOf(const Form& form);

/// The direction in which a control is placed in its container: that of the form, save where the container
/// says otherwise.
Direction PlacingOf(const Control& control);

/// The place of a control in its container, of which `container` is the width in twips. Mirrored from right
/// to left.
Area PlaceOf(const Geometry& control, int container, const Scale& scale, Direction direction);

/// What a control takes of its container. Both edges are rounded, not the width: controls that touch in twips
/// touch in pixels.
Extent ExtentOf(const Geometry& control, const Scale& scale);

/// The place in a control, in twips from its leading edge, of a spot in pixels from its left one.
Spot TwipsAt(double left, double top, int width, const Scale& scale, Direction direction);

enum class Side { Left, Right, Middle };

/// The side that an alignment means in a form that reads in this direction.
Side SideOf(Alignment alignment, Direction direction);

/// Where something of this extent comes to lie within a room: at the side, half way down.
Area AlignedIn(Side side, Extent extent, Area room);

/// The rectangle that the ends of a line span, in twips.
Geometry BoundsOf(const LineEnds& ends);

/// How a line crosses its rectangle.
enum class Stroke { Straight, Falling, Rising };
Stroke StrokeOf(const LineEnds& ends, Direction direction);

/// Pixels round the ends of a line: room for half of a thick stroke.
int StrokeRoom(int borderWidth);

} // namespace quendra::forms
