#pragma once

#include <algorithm>
#include <cmath>

namespace quendra::forms {

/// Twips to logical pixels of the screen and back.
struct Scale {
  double twipsPerPixelX = 15;
  double twipsPerPixelY = 15;
  /// The size that a form is shown in, 1 as it was laid out.
  double zoom = 1;

  int PixelsX(int twips) const { return static_cast<int>(std::lround(twips / twipsPerPixelX)); }
  int PixelsY(int twips) const { return static_cast<int>(std::lround(twips / twipsPerPixelY)); }
  int TwipsX(double pixels) const { return static_cast<int>(std::lround(pixels * twipsPerPixelX)); }
  int TwipsY(double pixels) const { return static_cast<int>(std::lround(pixels * twipsPerPixelY)); }
  /// A length that the look of a control has in pixels.
  int Pixels(int length) const { return static_cast<int>(std::lround(length * zoom)); }
  /// The size in points that letters are shown in; none vanish.
  double Points(int size) const { return std::max(1.0, size * zoom); }

  /// This scale of a screen for a form that is shown in another size.
  Scale Zoomed(double factor) const { return {twipsPerPixelX / factor, twipsPerPixelY / factor, factor}; }
  /// The screen's own, whatever size the form is shown in.
  Scale Unzoomed() const { return {twipsPerPixelX * zoom, twipsPerPixelY * zoom, 1}; }
};

} // namespace quendra::forms
