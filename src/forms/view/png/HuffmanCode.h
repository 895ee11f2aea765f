#pragma once

#include "forms/view/png/BitReader.h"

#include <array>
#include <vector>

namespace quendra::forms {

/// A code of symbols that have more bits the rarer they are, told by the number of bits of each (RFC 1951,
/// 3.2.2).
class HuffmanCode {
 public:
  static constexpr int kMostBits = 15;

  /// False where the numbers of bits can't belong to one code.
  bool Build(std::span<const std::uint8_t> lengths);
  /// The next symbol; -1 for bits that stand for none.
  int Read(BitReader& bits) const {
    const std::uint16_t known = short_[bits.Peek(kShortBits)];
    if (known == 0) return ReadLong(bits);
    bits.Skip(known & 15);
    return known >> 4;
  }

 private:
  static constexpr int kShortBits = 10;

  void EnterShort(int code, int length, int symbol);
  int ReadLong(BitReader& bits) const;

  std::array<std::uint16_t, kMostBits + 1> counts_{}; ///< codes of each number of bits
  std::vector<std::uint16_t> symbols_;                ///< in the order of their codes
  /// By the next bits: symbol and number of bits; 0 where the code is longer.
  std::array<std::uint16_t, 1 << kShortBits> short_{};
};

} // namespace quendra::forms
