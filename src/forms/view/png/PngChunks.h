#pragma once

#include <cstdint>
#include <optional>
#include <span>

namespace quendra::forms {

/// Names of chunks as the number that their four letters are.
inline constexpr std::uint32_t kHeaderChunk = 0x49484452;       // IHDR
inline constexpr std::uint32_t kPaletteChunk = 0x504C5445;      // PLTE
inline constexpr std::uint32_t kTransparencyChunk = 0x74524E53; // tRNS
inline constexpr std::uint32_t kDataChunk = 0x49444154;         // IDAT
inline constexpr std::uint32_t kEndChunk = 0x49454E44;          // IEND

/// A number of the first four bytes.
constexpr std::uint32_t BigEndian32(std::span<const std::uint8_t> bytes) {
  return static_cast<std::uint32_t>(bytes[0]) << 24 | static_cast<std::uint32_t>(bytes[1]) << 16 |
         static_cast<std::uint32_t>(bytes[2]) << 8 | bytes[3];
}

struct PngChunk {
  std::uint32_t name = 0;
  std::span<const std::uint8_t> data{};
  /// Who doesn't know it may pass over it: its first letter is a small one.
  bool IsOptional() const { return name & 0x20000000; }
};

/// The chunks of a PNG file, one after the other.
class PngChunks {
 public:
  explicit PngChunks(std::span<const std::uint8_t> file);
  /// None at the end, and where the file is none or its bytes don't have their check sum.
  std::optional<PngChunk> Next();

 private:
  std::span<const std::uint8_t> rest_;
};

} // namespace quendra::forms
