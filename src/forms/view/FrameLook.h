#pragma once

#include "forms/controls/Frame.h"
#include "forms/view/Area.h"
#include "forms/view/Direction.h"
#include "forms/view/Scale.h"

namespace quendra::forms {

// What frames look like: a border of one pixel with round corners and the caption on it.

/// The caption as it stands on the border; empty where there is none to be drawn.
Text TitleOf(const Frame& frame);

/// Pixels from the upper edge of a frame to its border, which runs through the middle of the caption.
double BorderTop(TextView title, int lineHeight);

/// Where the caption stands: as wide as its letters with a little ground on both sides.
Area TitlePlace(Extent letters, int frameWidth, const Scale& scale, Direction direction);

Colour TitleInk(const Frame& frame);

int FrameCorner(const Scale& scale);

} // namespace quendra::forms
