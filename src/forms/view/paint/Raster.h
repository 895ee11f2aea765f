#pragma once

#include "forms/controls/Colour.h"
#include "forms/controls/Picture.h"
#include "forms/view/Area.h"

#include <cstdint>
#include <span>

namespace quendra::forms {

/// A colour as pixels keep it: 0xAARRGGBB.
constexpr std::uint32_t ArgbOf(Colour colour, unsigned alpha = 255) {
  return alpha << 24 | (colour & 0xFF) << 16 | (colour & 0xFF00) | (colour >> 16 & 0xFF);
}

/// The part that two areas share; of no extent where they share none.
Area CommonPart(Area first, Area second);

/// What lies below a drawing.
enum class Ground {
  Opaque,    ///< whatever the alpha of its pixels says: a window's content
  SeeThrough ///< as far as the alpha says
};

/// Draws on pixels, 0xAARRGGBB and not multiplied by alpha, row by row from the top. Places count from
/// `origin`, and nothing is drawn outside the clip, which is given in the same places.
class Raster {
 public:
  Raster(std::span<std::uint32_t> pixels, Extent extent, Spot origin, Area clip,
         Ground ground = Ground::Opaque);
  /// All of a picture.
  explicit Raster(Picture::Pixels& picture)
      : Raster(picture.argb, {picture.width, picture.height}, {}, {{}, {picture.width, picture.height}},
               Ground::SeeThrough) {}

  /// Where drawing has an effect.
  Area Clip() const { return clip_; }

  void Fill(Area area, Colour colour);
  /// One pixel, of which `coverage` of 255 parts get the colour. Within the clip alone.
  void Blend(int x, int y, std::uint32_t argb, unsigned coverage = 255);
  /// A picture as large as it is.
  void Put(const Picture::Pixels& picture, Spot corner);

 private:
  std::uint32_t* At(int x, int y) const {
    return pixels_.data() + static_cast<std::ptrdiff_t>(y + origin_.top) * width_ + (x + origin_.left);
  }
  std::uint32_t Over(std::uint32_t below, std::uint32_t argb) const;

  std::span<std::uint32_t> pixels_;
  int width_;
  Spot origin_;
  Area clip_;
  Ground ground_;
};

} // namespace quendra::forms
