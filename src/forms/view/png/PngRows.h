#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

namespace quendra::forms {

enum class PngKind : std::uint8_t { Grey = 0, Colour = 2, Palette = 3, GreyAlpha = 4, ColourAlpha = 6 };

/// Bytes of a pixel; 0 for a kind that there isn't.
std::size_t ChannelsOf(PngKind kind);

struct PngHeader {
  int width = 0;
  int height = 0;
  PngKind kind = PngKind::Grey;

  std::size_t Channels() const { return ChannelsOf(kind); }
  std::size_t BytesOfRow() const { return static_cast<std::size_t>(width) * Channels(); }
  /// With the byte before each row that names its filter.
  std::size_t BytesOfRows() const { return static_cast<std::size_t>(height) * (BytesOfRow() + 1); }
};

/// Gives the bytes of all rows back what the filters have taken: what their neighbours tell already. False
/// for a filter that there isn't.
bool Unfilter(const PngHeader& header, std::span<std::uint8_t> rows);

} // namespace quendra::forms
