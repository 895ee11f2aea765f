#pragma once

#include <cstdint>
#include <initializer_list>
#include <span>
#include <string_view>
#include <vector>

namespace quendra::forms {

using Bytes = std::vector<std::uint8_t>;

inline void Append(Bytes& to, std::span<const std::uint8_t> more) {
  to.insert(to.end(), more.begin(), more.end());
}

inline void AppendNumber(Bytes& to, std::uint32_t number) {
  for (const int shift : {24, 16, 8, 0}) to.push_back(static_cast<std::uint8_t>(number >> shift));
}

/// The check sum of a chunk's name and data, a bit at a time.
inline std::uint32_t CheckSumOf(std::span<const std::uint8_t> bytes) {
  std::uint32_t sum = 0xFFFFFFFF;
  for (const std::uint8_t byte : bytes) {
    sum ^= byte;
    for (int bit = 0; bit < 8; ++bit) sum = sum & 1 ? sum >> 1 ^ 0xEDB88320 : sum >> 1;
  }
  return ~sum;
}

inline Bytes Chunk(std::string_view name, std::span<const std::uint8_t> data) {
  Bytes named(name.begin(), name.end());
  Append(named, data);
  Bytes chunk;
  AppendNumber(chunk, static_cast<std::uint32_t>(data.size()));
  Append(chunk, named);
  AppendNumber(chunk, CheckSumOf(named));
  return chunk;
}

/// In zlib's format, as it is. For 65,535 bytes at most.
inline Bytes Stored(std::span<const std::uint8_t> data) {
  const auto low = static_cast<std::uint8_t>(data.size() & 0xFF);
  const auto high = static_cast<std::uint8_t>(data.size() >> 8);
  Bytes packed{0x78,
               0x01,
               1,
               low,
               high,
               static_cast<std::uint8_t>(~low & 0xFF),
               static_cast<std::uint8_t>(~high & 0xFF)};
  Append(packed, data);
  return packed;
}

inline Bytes HeaderData(std::uint32_t width, std::uint32_t height, std::uint8_t kind, std::uint8_t depth = 8,
                        std::uint8_t interlaced = 0) {
  Bytes data;
  AppendNumber(data, width);
  AppendNumber(data, height);
  Append(data, Bytes{depth, kind, 0, 0, interlaced});
  return data;
}

inline Bytes Signature() { return {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'}; }

inline Bytes PngOfChunks(std::initializer_list<Bytes> chunks) {
  Bytes file = Signature();
  for (const Bytes& chunk : chunks) Append(file, chunk);
  return file;
}

/// `rows` has the bytes of all rows, each with its filter before it; `more` are the chunks before the data.
inline Bytes Png(std::uint32_t width, std::uint32_t height, std::uint8_t kind, const Bytes& rows,
                 const Bytes& more = {}) {
  return PngOfChunks(
      {Chunk("IHDR", HeaderData(width, height, kind)), more, Chunk("IDAT", Stored(rows)), Chunk("IEND", {})});
}

/// A file of one colour, 0xAARRGGBB, of 4 bytes a pixel.
inline Bytes PngOf(std::uint32_t width, std::uint32_t height, std::uint32_t argb) {
  Bytes rows;
  for (std::uint32_t y = 0; y < height; ++y) {
    rows.push_back(0);
    for (std::uint32_t x = 0; x < width; ++x)
      for (const int shift : {16, 8, 0, 24}) rows.push_back(static_cast<std::uint8_t>(argb >> shift));
  }
  return Png(width, height, 6, rows);
}

inline Bytes FromHex(std::string_view digits) {
  const auto value = [](char digit) { return digit <= '9' ? digit - '0' : digit - 'a' + 10; };
  Bytes bytes;
  for (std::size_t i = 0; i + 1 < digits.size(); i += 2)
    bytes.push_back(static_cast<std::uint8_t>(value(digits[i]) * 16 + value(digits[i + 1])));
  return bytes;
}

} // namespace quendra::forms
