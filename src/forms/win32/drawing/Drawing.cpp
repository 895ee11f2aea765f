#include "forms/win32/drawing/Drawing.h"

#include "forms/view/paint/Stretch.h"

#include <cstdlib>

namespace quendra::forms::win32 {

namespace {

UINT FlagsOf(const TextSetting& setting) {
  UINT flags = DT_NOPREFIX;
  if (setting.direction == Direction::RightToLeft) flags |= DT_RTLREADING;
  switch (setting.side) {
  case Side::Left: flags |= DT_LEFT; break;
  case Side::Right: flags |= DT_RIGHT; break;
  case Side::Middle: flags |= DT_CENTER; break;
  }
  if (setting.wraps) return flags | DT_WORDBREAK;
  return flags | DT_SINGLELINE | (setting.cuts ? DT_END_ELLIPSIS : 0U);
}

RECT RectOf(Area area) { return {area.corner.left, area.corner.top, area.Right(), area.Bottom()}; }

int DrawOrMeasure(HDC dc, TextView text, RECT& place, UINT flags) {
  return ::DrawTextW(dc, reinterpret_cast<const wchar_t*>(text.data()), static_cast<int>(text.size()), &place,
                     flags);
}

/// What the lines of a text need.
int HeightOf(HDC dc, TextView text, Extent room, UINT flags) {
  if (flags & DT_SINGLELINE) {
    TEXTMETRICW metrics{};
    ::GetTextMetricsW(dc, &metrics);
    return metrics.tmHeight;
  }
  RECT needed = RectOf({{}, room});
  DrawOrMeasure(dc, text, needed, flags | DT_CALCRECT);
  return static_cast<int>(needed.bottom - needed.top);
}

} // namespace

Drawing::Drawing(Surface& surface, Spot origin, Area clip)
    : surface_(surface), origin_(origin),
      clip_(CommonPart(clip, {{-origin.left, -origin.top}, surface.Size()})) {}

Drawing Drawing::Within(Area area) const {
  const Area part = CommonPart(area, clip_);
  const Spot corner = area.corner;
  return {surface_,
          {origin_.left + corner.left, origin_.top + corner.top},
          {{part.corner.left - corner.left, part.corner.top - corner.top}, part.extent}};
}

Raster Drawing::Pixels() const { return {surface_.Pixels(), surface_.Size(), origin_, clip_}; }

void Drawing::Fill(Area area, Colour colour) { Pixels().Fill(area, colour); }

void Drawing::Fill(const RoundBox& box, Colour colour) {
  Raster pixels = Pixels();
  FillRound(pixels, box, colour);
}

void Drawing::Stroke(const RoundBox& box, Colour colour, double width) {
  Raster pixels = Pixels();
  StrokeRound(pixels, box, width, colour);
}

void Drawing::RoundRect(Area area, int corner, std::optional<Colour> fill, std::optional<Colour> border,
                        int borderWidth) {
  const RoundBox box = RoundBox::Of(area, corner, border ? borderWidth / 2.0 : 0);
  if (fill) Fill(box, *fill);
  if (border) Stroke(box, *border, borderWidth);
}

void Drawing::Rings(Area ringed, const std::vector<Ring>& rings) {
  for (const Ring& ring : rings)
    Stroke(RoundBox::Of(ringed, ring.corner, ring.inset), ring.colour, ring.width);
}

void Drawing::Line(Spot from, Spot to, Colour colour, int width) {
  if (from.left != to.left && from.top != to.top) {
    Raster pixels = Pixels();
    return StrokeLine(pixels, {static_cast<double>(from.left), static_cast<double>(from.top)},
                      {static_cast<double>(to.left), static_cast<double>(to.top)}, width, colour);
  }
  const Area ends{{std::min(from.left, to.left), std::min(from.top, to.top)},
                  {std::abs(to.left - from.left), std::abs(to.top - from.top)}};
  const int before = width / 2;
  Fill({{ends.corner.left - before, ends.corner.top - before},
        {ends.extent.width + width, ends.extent.height + width}},
       colour);
}

void Drawing::Triangle(const std::array<Spot, 3>& corners, Colour colour) {
  const auto point = [](Spot spot) {
    return Point{static_cast<double>(spot.left), static_cast<double>(spot.top)};
  };
  Raster pixels = Pixels();
  FillTriangle(pixels, {point(corners[0]), point(corners[1]), point(corners[2])}, colour);
}

void Drawing::Picture(const Bitmap& bitmap, Area area) {
  if (!IsWhole(bitmap) || CommonPart(area, clip_).extent.width == 0) return;
  const bool fits = area.extent == Extent{bitmap.width, bitmap.height};
  Pixels().Put(fits ? bitmap : Stretched(bitmap, area.extent), area.corner);
}

void Drawing::Text(TextView text, Area area, HFONT font, Colour colour, const TextSetting& setting) {
  if (text.empty() || clip_.extent.width == 0 || clip_.extent.height == 0) return;
  const HDC dc = surface_.Dc();
  const int state = ::SaveDC(dc);
  ::SetViewportOrgEx(dc, origin_.left, origin_.top, nullptr);
  ::IntersectClipRect(dc, clip_.corner.left, clip_.corner.top, clip_.Right(), clip_.Bottom());
  ::SelectObject(dc, font);
  ::SetTextColor(dc, colour);
  const UINT flags = FlagsOf(setting);
  RECT place = RectOf(area);
  if (!setting.fromTop) place.top += (area.extent.height - HeightOf(dc, text, area.extent, flags)) / 2;
  // Letters may reach beyond the place that they were given; the clip alone holds them.
  DrawOrMeasure(dc, text, place, flags | DT_NOCLIP);
  ::RestoreDC(dc, state);
}

Extent MeasureText(TextView text, HFONT font, int width) {
  if (text.empty()) return {};
  const HDC dc = ::CreateCompatibleDC(nullptr);
  const HGDIOBJ before = ::SelectObject(dc, font);
  RECT needed{0, 0, width, 0};
  DrawOrMeasure(dc, text, needed, DT_NOPREFIX | DT_CALCRECT | (width ? DT_WORDBREAK : DT_SINGLELINE));
  ::SelectObject(dc, before);
  ::DeleteDC(dc);
  return {static_cast<int>(needed.right - needed.left), static_cast<int>(needed.bottom - needed.top)};
}

} // namespace quendra::forms::win32
