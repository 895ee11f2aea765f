#include "forms/view/png/PngRows.h"

#include <cstdlib>
#include <vector>

namespace quendra::forms {

namespace {

enum Filter : std::uint8_t { kNone, kLeft, kAbove, kMean, kNearest };

/// Whichever of the three is nearest to left plus above less both.
std::uint8_t Nearest(int left, int above, int both) {
  const int fromLeft = std::abs(above - both);
  const int fromAbove = std::abs(left - both);
  const int fromBoth = std::abs(left + above - 2 * both);
  if (fromLeft <= fromAbove && fromLeft <= fromBoth) return static_cast<std::uint8_t>(left);
  return static_cast<std::uint8_t>(fromAbove <= fromBoth ? above : both);
}

/// `told` tells a byte by its neighbours: to the left, above, and left above; 0 outside.
template <typename Told>
void Restore(std::span<std::uint8_t> row, std::span<const std::uint8_t> above, std::size_t channels,
             const Told& told) {
  for (std::size_t i = 0; i < channels; ++i)
    row[i] = static_cast<std::uint8_t>(row[i] + told(0, above[i], 0));
  for (std::size_t i = channels; i < row.size(); ++i)
    row[i] = static_cast<std::uint8_t>(row[i] + told(row[i - channels], above[i], above[i - channels]));
}

bool RestoreRow(std::uint8_t filter, std::span<std::uint8_t> row, std::span<const std::uint8_t> above,
                std::size_t channels) {
  switch (filter) {
  case kNone: return true;
  case kLeft: Restore(row, above, channels, [](int left, int, int) { return left; }); return true;
  case kAbove: Restore(row, above, channels, [](int, int over, int) { return over; }); return true;
  case kMean:
    Restore(row, above, channels, [](int left, int over, int) { return (left + over) / 2; });
    return true;
  case kNearest: Restore(row, above, channels, Nearest); return true;
  default: return false;
  }
}

} // namespace

std::size_t ChannelsOf(PngKind kind) {
  switch (kind) {
  case PngKind::Grey:
  case PngKind::Palette: return 1;
  case PngKind::GreyAlpha: return 2;
  case PngKind::Colour: return 3;
  case PngKind::ColourAlpha: return 4;
  }
  return 0;
}

bool Unfilter(const PngHeader& header, std::span<std::uint8_t> rows) {
  const std::size_t length = header.BytesOfRow();
  const std::vector<std::uint8_t> nothing(length);
  std::span<const std::uint8_t> above = nothing;
  for (std::size_t at = 0; at < rows.size(); at += length + 1) {
    const auto row = rows.subspan(at + 1, length);
    if (!RestoreRow(rows[at], row, above, header.Channels())) return false;
    above = row;
  }
  return true;
}

} // namespace quendra::forms
