#include "forms/view/paint/Shapes.h"

#include <algorithm>
#include <cmath>

namespace quendra::forms {

namespace {

/// The whole pixels that lie in the box at least in part.
Area PixelsOf(double left, double top, double right, double bottom) {
  const Spot corner{static_cast<int>(std::floor(left)), static_cast<int>(std::floor(top))};
  return {
      corner,
      {static_cast<int>(std::ceil(right)) - corner.left, static_cast<int>(std::ceil(bottom)) - corner.top}};
}

Area PixelsOf(const RoundBox& box, double reach) {
  return PixelsOf(box.left - reach, box.top - reach, box.right + reach, box.bottom + reach);
}

/// The pixels that lie so deep in the box that neither its edge nor a line of that reach along it touches
/// them.
Area InsideOf(const RoundBox& box, double reach) {
  const int margin = -static_cast<int>(std::ceil(std::max(box.corner, reach) + 1));
  const Area inside = PixelsOf(box, 0).GrownBy(margin);
  return {inside.corner, {std::max(0, inside.extent.width), std::max(0, inside.extent.height)}};
}

/// How far a point lies outside of the box; negative inside.
double DistanceTo(const RoundBox& box, Point point) {
  const double halfWidth = (box.right - box.left) / 2;
  const double halfHeight = (box.bottom - box.top) / 2;
  const double corner = std::min({box.corner, halfWidth, halfHeight});
  const double x = std::abs(point.x - box.left - halfWidth) - halfWidth + corner;
  const double y = std::abs(point.y - box.top - halfHeight) - halfHeight + corner;
  // Beside a straight edge, which most points are.
  if (x <= 0 || y <= 0) return std::max(x, y) - corner;
  return std::sqrt(x * x + y * y) - corner;
}

/// Blends the pixels of an area by how far their middles lie outside of a shape.
template <typename Distance> void Cover(Raster& raster, Area area, Colour colour, const Distance& distance) {
  const Area part = CommonPart(area, raster.Clip());
  for (int y = part.corner.top; y < part.Bottom(); ++y)
    for (int x = part.corner.left; x < part.Right(); ++x) {
      const double covered = std::clamp(0.5 - distance(Point{x + 0.5, y + 0.5}), 0.0, 1.0);
      if (covered > 0) raster.Blend(x, y, ArgbOf(colour), static_cast<unsigned>(std::lround(covered * 255)));
    }
}

/// The same for all of an area but its inside.
template <typename Distance>
void CoverRound(Raster& raster, Area area, Area inside, Colour colour, const Distance& distance) {
  if (inside.extent.width == 0 || inside.extent.height == 0) return Cover(raster, area, colour, distance);
  const int above = inside.corner.top - area.corner.top;
  const int before = inside.corner.left - area.corner.left;
  const int left = area.corner.left;
  const Area parts[] = {
      {area.corner, {area.extent.width, above}},
      {{left, inside.Bottom()}, {area.extent.width, area.Bottom() - inside.Bottom()}},
      {{left, inside.corner.top}, {before, inside.extent.height}},
      {{inside.Right(), inside.corner.top}, {area.Right() - inside.Right(), inside.extent.height}}};
  for (const Area& part : parts) Cover(raster, part, colour, distance);
}

/// How far a point lies to the left of a way.
double LeftOf(Point from, Point to, Point point) {
  const double x = to.x - from.x;
  const double y = to.y - from.y;
  const double length = std::hypot(x, y);
  if (length == 0) return 0;
  return ((point.x - from.x) * y - (point.y - from.y) * x) / length;
}

} // namespace

void FillRound(Raster& raster, const RoundBox& box, Colour colour) {
  const Area inside = InsideOf(box, 0);
  raster.Fill(inside, colour);
  CoverRound(raster, PixelsOf(box, 0), inside, colour, [&](Point at) { return DistanceTo(box, at); });
}

void StrokeRound(Raster& raster, const RoundBox& box, double width, Colour colour) {
  const double reach = width / 2;
  CoverRound(raster, PixelsOf(box, reach), InsideOf(box, reach), colour,
             [&](Point at) { return std::abs(DistanceTo(box, at)) - reach; });
}

void StrokeLine(Raster& raster, Point from, Point to, double width, Colour colour) {
  const double reach = width / 2;
  const double half = std::hypot(to.x - from.x, to.y - from.y) / 2;
  const Point middle{(from.x + to.x) / 2, (from.y + to.y) / 2};
  // At a right angle to the line in its middle.
  const Point aside{middle.x + (to.y - from.y), middle.y - (to.x - from.x)};
  const double around = reach * 2 + 1;
  Cover(raster,
        PixelsOf(std::min(from.x, to.x) - around, std::min(from.y, to.y) - around,
                 std::max(from.x, to.x) + around, std::max(from.y, to.y) + around),
        colour, [&](Point at) {
          return std::max(std::abs(LeftOf(from, to, at)) - reach,
                          std::abs(LeftOf(middle, aside, at)) - half - reach);
        });
}

void FillTriangle(Raster& raster, const std::array<Point, 3>& corners, Colour colour) {
  const Point a = corners[0];
  const Point b = corners[1];
  const Point c = corners[2];
  const double sense = LeftOf(a, b, c) > 0 ? -1 : 1;
  const auto [left, right] = std::minmax({a.x, b.x, c.x});
  const auto [top, bottom] = std::minmax({a.y, b.y, c.y});
  Cover(raster, PixelsOf(left, top, right, bottom), colour, [&](Point at) {
    return std::max({sense * LeftOf(a, b, at), sense * LeftOf(b, c, at), sense * LeftOf(c, a, at)});
  });
}

} // namespace quendra::forms
