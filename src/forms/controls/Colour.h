#pragma once

#include <cstdint>

namespace quendra::forms {

/// A colour as the platform packs it: red in the low byte, then green, then blue.
using Colour = std::uint32_t;

constexpr Colour Rgb(unsigned red, unsigned green, unsigned blue) { return red | green << 8 | blue << 16; }

inline constexpr Colour kBlack = 0;
inline constexpr Colour kRed = 255;
inline constexpr Colour kGreen = 32768;
inline constexpr Colour kWhite = 0xFFFFFF;

} // namespace quendra::forms
