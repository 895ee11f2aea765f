#include "forms/view/png/PngChunks.h"

#include <algorithm>
#include <array>

namespace quendra::forms {

namespace {

constexpr std::array<std::uint8_t, 8> kSignature{0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'};

constexpr std::array<std::uint32_t, 256> RemaindersOfBytes() {
  std::array<std::uint32_t, 256> table{};
  for (std::uint32_t byte = 0; byte < table.size(); ++byte) {
    std::uint32_t remainder = byte;
    for (int bit = 0; bit < 8; ++bit)
      remainder = remainder & 1 ? remainder >> 1 ^ 0xEDB88320 : remainder >> 1;
    table[byte] = remainder;
  }
  return table;
}

std::uint32_t CheckSum(std::span<const std::uint8_t> bytes) {
  static constexpr std::array<std::uint32_t, 256> kTable = RemaindersOfBytes();
  std::uint32_t sum = 0xFFFFFFFF;
  for (const std::uint8_t byte : bytes) sum = sum >> 8 ^ kTable[(sum ^ byte) & 0xFF];
  return ~sum;
}

} // namespace

PngChunks::PngChunks(std::span<const std::uint8_t> file) {
  if (file.size() >= kSignature.size() && std::equal(kSignature.begin(), kSignature.end(), file.begin()))
    rest_ = file.subspan(kSignature.size());
}

std::optional<PngChunk> PngChunks::Next() {
  constexpr std::size_t kAround = 12; // length, name and check sum
  if (rest_.size() < kAround) return std::nullopt;
  const std::size_t length = BigEndian32(rest_);
  if (length > rest_.size() - kAround) return std::nullopt;
  const auto named = rest_.subspan(4, length + 4);
  if (CheckSum(named) != BigEndian32(rest_.subspan(length + 8))) return std::nullopt;
  rest_ = rest_.subspan(length + kAround);
  return PngChunk{BigEndian32(named), named.subspan(4)};
}

} // namespace quendra::forms
