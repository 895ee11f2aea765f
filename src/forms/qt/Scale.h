#pragma once

#include <cmath>

namespace quendra::forms::qt {

/// Twips to logical pixels of the screen and back.
struct Scale {
  double twipsPerPixelX = 15;
  double twipsPerPixelY = 15;

  int PixelsX(int twips) const { return static_cast<int>(std::lround(twips / twipsPerPixelX)); }
  int PixelsY(int twips) const { return static_cast<int>(std::lround(twips / twipsPerPixelY)); }
  int TwipsX(double pixels) const { return static_cast<int>(std::lround(pixels * twipsPerPixelX)); }
  int TwipsY(double pixels) const { return static_cast<int>(std::lround(pixels * twipsPerPixelY)); }
};

} // namespace quendra::forms::qt
