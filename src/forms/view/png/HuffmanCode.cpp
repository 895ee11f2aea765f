#include "forms/view/png/HuffmanCode.h"

namespace quendra::forms {

namespace {

/// Codes stand in the data with their highest bit first.
std::uint32_t Reversed(int code, int length) {
  std::uint32_t reversed = 0;
  for (int bit = 0; bit < length; ++bit)
    reversed |= (static_cast<std::uint32_t>(code) >> bit & 1U) << (length - 1 - bit);
  return reversed;
}

} // namespace

bool HuffmanCode::Build(std::span<const std::uint8_t> lengths) {
  counts_ = {};
  short_ = {};
  for (const std::uint8_t length : lengths) {
    if (length > kMostBits) return false;
    if (length) ++counts_[length];
  }
  std::array<int, kMostBits + 2> nextCode{};
  std::array<std::size_t, kMostBits + 2> nextPlace{};
  for (std::size_t length = 1; length <= kMostBits; ++length) {
    if (nextCode[length] + counts_[length] > 1 << length) return false;
    nextCode[length + 1] = (nextCode[length] + counts_[length]) * 2;
    nextPlace[length + 1] = nextPlace[length] + counts_[length];
  }
  symbols_.assign(lengths.size(), 0);
  for (std::size_t symbol = 0; symbol < lengths.size(); ++symbol) {
    const std::size_t length = lengths[symbol];
    if (!length) continue;
    symbols_[nextPlace[length]++] = static_cast<std::uint16_t>(symbol);
    EnterShort(nextCode[length]++, static_cast<int>(length), static_cast<int>(symbol));
  }
  return true;
}

void HuffmanCode::EnterShort(int code, int length, int symbol) {
  if (length > kShortBits) return;
  const std::uint32_t step = 1U << length;
  for (std::uint32_t bits = Reversed(code, length); bits < short_.size(); bits += step)
    short_[bits] = static_cast<std::uint16_t>(symbol << 4 | length);
}

int HuffmanCode::ReadLong(BitReader& bits) const {
  const std::uint32_t next = bits.Peek(kMostBits);
  int code = 0;
  int first = 0;
  int place = 0;
  for (int length = 1; length <= kMostBits; ++length) {
    code |= static_cast<int>(next >> (length - 1) & 1U);
    const int count = counts_[static_cast<std::size_t>(length)];
    if (code - first < count) {
      bits.Skip(length);
      return symbols_[static_cast<std::size_t>(place + code - first)];
    }
    place += count;
    first = (first + count) * 2;
    code *= 2;
  }
  return -1;
}

} // namespace quendra::forms
