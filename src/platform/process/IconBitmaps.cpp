#include "platform/process/IconBitmaps.h"

#include "runtime/ByteFields.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace quendra::platform {

namespace {

using Bytes = std::vector<std::uint8_t>;

constexpr std::uint32_t kColour = 0x00FFFFFF;
constexpr std::uint32_t kOpaque = 0xFF000000;

void Append32(Bytes& bytes, std::uint32_t value) {
  bytes.resize(bytes.size() + sizeof value);
  PutBig32(bytes, bytes.size() - sizeof value, value);
}

std::uint32_t ShownPixel(std::uint32_t colour, std::uint32_t mask) {
  colour &= kColour;
  if ((mask & kColour) == 0) return colour | kOpaque;
  return colour == 0 ? 0 : (~colour & kColour) | kOpaque;
}

/// With the alpha that the file shall have.
std::vector<std::uint32_t> PixelsOf(const IconBitmaps& icon) {
  if (std::ranges::any_of(icon.colours, [](std::uint32_t colour) { return (colour & kOpaque) != 0; }))
    return icon.colours;
  std::vector<std::uint32_t> pixels(icon.colours.size());
  std::ranges::transform(icon.colours, icon.mask, pixels.begin(), ShownPixel);
  return pixels;
}

/// Rows of red, green, blue and alpha, each behind the number of its filter: none.
Bytes RowsOf(const std::vector<std::uint32_t>& pixels, std::size_t width) {
  Bytes rows;
  rows.reserve(pixels.size() * 4 + pixels.size() / width);
  for (std::size_t i = 0; i < pixels.size(); ++i) {
    if (i % width == 0) rows.push_back(0);
    Append32(rows, pixels[i] << 8 | pixels[i] >> 24);
  }
  return rows;
}

std::uint32_t Adler32(const Bytes& bytes) {
  constexpr std::uint32_t kPrime = 65521;
  std::uint32_t sum = 1, sums = 0;
  for (const std::uint8_t byte : bytes) {
    sum = (sum + byte) % kPrime;
    sums = (sums + sum) % kPrime;
  }
  return sums << 16 | sum;
}

std::uint32_t Crc32(const Bytes& bytes) {
  std::uint32_t crc = 0xFFFFFFFF;
  for (const std::uint8_t byte : bytes) {
    crc ^= byte;
    for (int bit = 0; bit < 8; ++bit) crc = (crc & 1) != 0 ? crc >> 1 ^ 0xEDB88320 : crc >> 1;
  }
  return ~crc;
}

/// A compressed stream of blocks that are stored as they are.
Bytes Stored(const Bytes& bytes) {
  constexpr std::size_t kLongestBlock = 65535;
  Bytes stream{0x78, 0x01};
  for (std::size_t at = 0; at < bytes.size(); at += kLongestBlock) {
    const std::size_t length = std::min(kLongestBlock, bytes.size() - at);
    const bool isLast = at + length == bytes.size();
    std::array<std::uint8_t, 5> header{static_cast<std::uint8_t>(isLast)};
    PutLittle16(header, 1, static_cast<std::uint16_t>(length));
    PutLittle16(header, 3, static_cast<std::uint16_t>(~length));
    stream.insert(stream.end(), header.begin(), header.end());
    const auto from = bytes.begin() + static_cast<std::ptrdiff_t>(at);
    stream.insert(stream.end(), from, from + static_cast<std::ptrdiff_t>(length));
  }
  Append32(stream, Adler32(bytes));
  return stream;
}

void AppendChunk(Bytes& file, std::string_view type, const Bytes& data) {
  Append32(file, static_cast<std::uint32_t>(data.size()));
  Bytes named(type.begin(), type.end());
  named.insert(named.end(), data.begin(), data.end());
  file.insert(file.end(), named.begin(), named.end());
  Append32(file, Crc32(named));
}

} // namespace

Bytes PngOf(const IconBitmaps& icon) {
  const std::size_t count = icon.colours.size();
  if (count == 0 || icon.width == 0 || count % icon.width != 0 || icon.mask.size() != count) return {};
  Bytes header;
  Append32(header, static_cast<std::uint32_t>(icon.width));
  Append32(header, static_cast<std::uint32_t>(count / icon.width));
  // Eight bits a channel, colours with alpha, and the only ways there are to compress, filter and order.
  header.insert(header.end(), {8, 6, 0, 0, 0});
  Bytes file{0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'};
  AppendChunk(file, "IHDR", header);
  AppendChunk(file, "IDAT", Stored(RowsOf(PixelsOf(icon), icon.width)));
  AppendChunk(file, "IEND", {});
  return file;
}

} // namespace quendra::platform
