#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace quendra::platform {

/// An icon as systems of windows keep it, a pixel 0xAARRGGBB, the top row first. Where the mask is not black,
/// what lies below the icon shows.
struct IconBitmaps {
  std::size_t width = 0;
  std::vector<std::uint32_t> colours{};
  std::vector<std::uint32_t> mask{};
};

/// The bytes of a PNG file, uncompressed. Colours with an alpha anywhere are taken with it. Others show where
/// the mask is black; a colour elsewhere turns what lies below into its opposite, here as over white. Empty
/// for an icon without pixels, or with a mask of another size.
std::vector<std::uint8_t> PngOf(const IconBitmaps& icon);

} // namespace quendra::platform
