#pragma once

#include "forms/controls/Picture.h"

namespace quendra::forms::win32 {

/// A decoded picture: 0xAARRGGBB, not multiplied by alpha, row by row from the top.
using Bitmap = Picture::Pixels;

} // namespace quendra::forms::win32
