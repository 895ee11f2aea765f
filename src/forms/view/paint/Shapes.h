#pragma once

#include "forms/view/paint/Raster.h"

#include <array>

namespace quendra::forms {

// Shapes with smooth edges: a pixel gets as much of the colour as the shape covers of it. Places are those of
// the pixels' edges, so that the middle of the first pixel lies at one half.

struct Point {
  double x = 0;
  double y = 0;
};

/// A rectangle with round corners.
struct RoundBox {
  double left = 0;
  double top = 0;
  double right = 0;
  double bottom = 0;
  double corner = 0; ///< the radius

  /// What covers the pixels of an area, or `inset` less on each side.
  static RoundBox Of(Area area, double corner, double inset = 0) {
    return {area.corner.left + inset, area.corner.top + inset, area.Right() - inset, area.Bottom() - inset,
            corner};
  }
};

void FillRound(Raster& raster, const RoundBox& box, Colour colour);
/// Its edge as a line, the middle of which runs along it.
void StrokeRound(Raster& raster, const RoundBox& box, double width, Colour colour);
/// A straight line, which goes on for half its width beyond both ends.
void StrokeLine(Raster& raster, Point from, Point to, double width, Colour colour);
/// Corners in either order of going round.
void FillTriangle(Raster& raster, const std::array<Point, 3>& corners, Colour colour);

} // namespace quendra::forms
