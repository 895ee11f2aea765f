#include "forms/view/png/PngReader.h"

#include "forms/view/png/Inflate.h"
#include "forms/view/png/PngChunks.h"
#include "forms/view/png/PngRows.h"

#include <algorithm>
#include <array>

namespace quendra::forms {

namespace {

constexpr std::uint32_t kLargestSide = 2048;

std::uint32_t Opaque(unsigned red, unsigned green, unsigned blue) {
  return 0xFF000000 | red << 16 | green << 8 | blue;
}

std::optional<PngHeader> HeaderIn(std::span<const std::uint8_t> data) {
  constexpr std::size_t kLength = 13;
  if (data.size() != kLength) return std::nullopt;
  const std::uint32_t width = BigEndian32(data);
  const std::uint32_t height = BigEndian32(data.subspan(4));
  if (width == 0 || height == 0 || width > kLargestSide || height > kLargestSide) return std::nullopt;
  const bool isPlain = data[8] == 8 && data[10] == 0 && data[11] == 0 && data[12] == 0;
  if (!isPlain || ChannelsOf(static_cast<PngKind>(data[9])) == 0) return std::nullopt;
  return PngHeader{static_cast<int>(width), static_cast<int>(height), static_cast<PngKind>(data[9])};
}

/// What the chunks of a file say, each told where it counts.
class PngFile {
 public:
  bool Read(std::span<const std::uint8_t> file) {
    PngChunks chunks(file);
    while (const auto chunk = chunks.Next()) {
      if (chunk->name == kEndChunk) return header_ && !packed_.empty();
      if (!Take(*chunk)) return false;
    }
    return false;
  }

  std::optional<Picture::Pixels> Pixels() const {
    std::vector<std::uint8_t> rows(header_->BytesOfRows());
    if (!Inflate(packed_, rows) || !Unfilter(*header_, rows)) return std::nullopt;
    Picture::Pixels pixels{header_->width, header_->height, {}};
    pixels.argb.resize(static_cast<std::size_t>(pixels.width) * static_cast<std::size_t>(pixels.height));
    Convert(rows, pixels.argb);
    return pixels;
  }

 private:
  bool Take(const PngChunk& chunk) {
    if (!header_) {
      header_ = chunk.name == kHeaderChunk ? HeaderIn(chunk.data) : std::nullopt;
      return header_.has_value();
    }
    if (chunk.name == kDataChunk)
      packed_.insert(packed_.end(), chunk.data.begin(), chunk.data.end());
    else if (chunk.name == kPaletteChunk)
      return TakePalette(chunk.data);
    else if (chunk.name == kTransparencyChunk)
      TakeTransparency(chunk.data);
    else
      return chunk.IsOptional();
    return true;
  }

  bool TakePalette(std::span<const std::uint8_t> data) {
    if (data.size() % 3 != 0 || data.size() > palette_.size() * 3) return false;
    for (std::size_t i = 0; i < data.size() / 3; ++i)
      palette_[i] = Opaque(data[3 * i], data[3 * i + 1], data[3 * i + 2]);
    return true;
  }

  /// Of a palette the alpha of its first colours, else the one colour that is seen through.
  void TakeTransparency(std::span<const std::uint8_t> data) {
    if (header_->kind == PngKind::Palette) {
      for (std::size_t i = 0; i < std::min(data.size(), palette_.size()); ++i)
        palette_[i] = (palette_[i] & 0xFFFFFF) | static_cast<std::uint32_t>(data[i]) << 24;
    } else if (header_->kind == PngKind::Grey && data.size() == 2) {
      seenThrough_ = Opaque(data[1], data[1], data[1]);
    } else if (header_->kind == PngKind::Colour && data.size() == 6) {
      seenThrough_ = Opaque(data[1], data[3], data[5]);
    }
  }

  void Convert(std::span<const std::uint8_t> rows, std::span<std::uint32_t> argb) const {
    using Part = const std::uint8_t*;
    switch (header_->kind) {
    case PngKind::Grey:
      return ConvertBy(rows, argb, [&](Part part) { return Seen(Opaque(part[0], part[0], part[0])); });
    case PngKind::Colour:
      return ConvertBy(rows, argb, [&](Part part) { return Seen(Opaque(part[0], part[1], part[2])); });
    case PngKind::Palette: return ConvertBy(rows, argb, [&](Part part) { return palette_[part[0]]; });
    case PngKind::GreyAlpha:
      return ConvertBy(rows, argb,
                       [](Part part) { return WithAlpha(Opaque(part[0], part[0], part[0]), part[1]); });
    case PngKind::ColourAlpha:
      return ConvertBy(rows, argb,
                       [](Part part) { return WithAlpha(Opaque(part[0], part[1], part[2]), part[3]); });
    }
  }

  /// `convert` takes the first byte of a pixel.
  template <typename Conversion>
  void ConvertBy(std::span<const std::uint8_t> rows, std::span<std::uint32_t> argb,
                 const Conversion& convert) const {
    const std::size_t channels = header_->Channels();
    const std::uint8_t* part = rows.data();
    auto pixel = argb.begin();
    while (pixel != argb.end()) {
      ++part; // its filter
      for (int x = 0; x < header_->width; ++x, part += channels) *pixel++ = convert(part);
    }
  }

  std::uint32_t Seen(std::uint32_t argb) const { return argb == seenThrough_ ? 0 : argb; }
  static std::uint32_t WithAlpha(std::uint32_t argb, std::uint32_t alpha) {
    return (argb & 0xFFFFFF) | alpha << 24;
  }

  std::optional<PngHeader> header_;
  std::array<std::uint32_t, 256> palette_{};
  std::optional<std::uint32_t> seenThrough_;
  std::vector<std::uint8_t> packed_;
};

} // namespace

std::optional<Picture::Pixels> ReadPng(std::span<const std::uint8_t> file) {
  constexpr std::size_t kMostBytes = 8 * 1024 * 1024;
  PngFile png;
  if (file.size() > kMostBytes || !png.Read(file)) return std::nullopt;
  return png.Pixels();
}

} // namespace quendra::forms
