#include "forms/view/paint/Raster.h"

#include <algorithm>

namespace quendra::forms {

namespace {

/// A product of two parts of 255 as such a part, rounded.
constexpr unsigned Times(unsigned first, unsigned second) { return (first * second + 127) / 255; }

constexpr unsigned Mixed(unsigned below, unsigned above, unsigned share) {
  return (below * (255 - share) + above * share + 127) / 255;
}

std::uint32_t OverOpaque(std::uint32_t below, std::uint32_t above, unsigned alpha) {
  std::uint32_t mixed = 0xFF000000;
  for (const int shift : {0, 8, 16})
    mixed |= Mixed(below >> shift & 0xFF, above >> shift & 0xFF, alpha) << shift;
  return mixed;
}

std::uint32_t OverSeeThrough(std::uint32_t below, std::uint32_t above, unsigned alpha) {
  const unsigned kept = Times(below >> 24, 255 - alpha);
  const unsigned both = alpha + kept;
  if (both == 0) return 0;
  std::uint32_t mixed = both << 24;
  for (const int shift : {0, 8, 16}) {
    const unsigned sum = (below >> shift & 0xFF) * kept + (above >> shift & 0xFF) * alpha;
    mixed |= (sum + both / 2) / both << shift;
  }
  return mixed;
}

} // namespace

Area CommonPart(Area first, Area second) {
  const Spot corner{std::max(first.corner.left, second.corner.left),
                    std::max(first.corner.top, second.corner.top)};
  const int right = std::min(first.Right(), second.Right());
  const int bottom = std::min(first.Bottom(), second.Bottom());
  return {corner, {std::max(0, right - corner.left), std::max(0, bottom - corner.top)}};
}

Raster::Raster(std::span<std::uint32_t> pixels, Extent extent, Spot origin, Area clip, Ground ground)
    : pixels_(pixels), width_(extent.width), origin_(origin),
      clip_(CommonPart(clip, {{-origin.left, -origin.top}, extent})), ground_(ground) {}

void Raster::Fill(Area area, Colour colour) {
  const Area part = CommonPart(area, clip_);
  for (int y = part.corner.top; y < part.Bottom(); ++y)
    std::fill_n(At(part.corner.left, y), part.extent.width, ArgbOf(colour));
}

void Raster::Put(const Picture::Pixels& picture, Spot corner) {
  const Area part = CommonPart({corner, {picture.width, picture.height}}, clip_);
  for (int y = part.corner.top; y < part.Bottom(); ++y) {
    const std::uint32_t* from = picture.argb.data() +
                                static_cast<std::ptrdiff_t>(y - corner.top) * picture.width +
                                (part.corner.left - corner.left);
    std::uint32_t* to = At(part.corner.left, y);
    for (int x = 0; x < part.extent.width; ++x) to[x] = Over(to[x], from[x]);
  }
}

void Raster::Blend(int x, int y, std::uint32_t argb, unsigned coverage) {
  std::uint32_t& below = *At(x, y);
  below = Over(below, Times(argb >> 24, coverage) << 24 | (argb & 0xFFFFFF));
}

std::uint32_t Raster::Over(std::uint32_t below, std::uint32_t argb) const {
  const unsigned alpha = argb >> 24;
  if (alpha == 0) return below;
  if (alpha == 255) return argb;
  return ground_ == Ground::Opaque ? OverOpaque(below, argb, alpha) : OverSeeThrough(below, argb, alpha);
}

} // namespace quendra::forms
