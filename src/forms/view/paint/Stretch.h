#pragma once

#include "forms/controls/Picture.h"
#include "forms/view/Area.h"

namespace quendra::forms {

/// Whether a picture has pixels, and as many as it says.
bool IsWhole(const Picture::Pixels& picture);

/// The picture in another size, smoothly: each of its pixels has its part in the result. Empty where there is
/// nothing to be shown.
Picture::Pixels Stretched(const Picture::Pixels& picture, Extent extent);

/// The largest extent within `bounds` that has the proportions of a picture, a pixel at least on each side.
Extent FittedInto(Extent picture, Extent bounds);

} // namespace quendra::forms
