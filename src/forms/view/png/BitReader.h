#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

namespace quendra::forms {

/// Bits of bytes, the lowest of each byte first. Behind the end come zeros, and `RanOut` tells of it.
class BitReader {
 public:
  explicit BitReader(std::span<const std::uint8_t> bytes) : bytes_(bytes) {}

  /// The next bits, 16 at most, which stay.
  std::uint32_t Peek(int count) {
    while (waiting_ < count) {
      const std::uint32_t byte = next_ < bytes_.size() ? bytes_[next_] : 0U;
      ++next_;
      bits_ |= byte << waiting_;
      waiting_ += 8;
    }
    return bits_ & ((1U << count) - 1);
  }
  void Skip(int count) {
    bits_ >>= count;
    waiting_ -= count;
  }
  std::uint32_t Take(int count) {
    const std::uint32_t bits = Peek(count);
    Skip(count);
    return bits;
  }
  void SkipToByte() { Skip(waiting_ & 7); }
  /// More bits were taken than there were.
  bool RanOut() const { return next_ > bytes_.size() + static_cast<std::size_t>(waiting_ / 8); }

 private:
  std::span<const std::uint8_t> bytes_;
  std::size_t next_ = 0;
  std::uint32_t bits_ = 0;
  int waiting_ = 0;
};

} // namespace quendra::forms
