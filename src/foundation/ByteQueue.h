#pragma once

#include "runtime/ByteArray.h"

#include <cstdint>
#include <span>
#include <utility>

namespace quendra::foundation {

/// Bytes that come in at the end and leave at the front, each moved a bounded number of times.
class ByteQueue {
 public:
  std::size_t Size() const { return bytes_.size() - taken_; }
  bool IsEmpty() const { return Size() == 0; }
  std::span<const std::uint8_t> Front(std::size_t count) const { return {bytes_.data() + taken_, count}; }

  void Append(std::span<const std::uint8_t> bytes) {
    bytes_.insert(bytes_.end(), bytes.begin(), bytes.end());
  }
  /// Room for `count` bytes at the end, without a value yet; what isn't used goes back by `DropLast`.
  std::span<std::uint8_t> Extend(std::size_t count) {
    bytes_.resize(bytes_.size() + count);
    return {bytes_.data() + bytes_.size() - count, count};
  }
  void DropLast(std::size_t count) { bytes_.resize(bytes_.size() - count); }

  void DropFirst(std::size_t count) {
    taken_ += count;
    if (taken_ == bytes_.size()) return Clear();
    if (taken_ < bytes_.size() / 2) return;
    bytes_.erase(bytes_.begin(), bytes_.begin() + static_cast<std::ptrdiff_t>(taken_));
    taken_ = 0;
  }
  /// Takes `count` bytes away; all of them without a copy where nothing was taken before.
  ByteArray Take(std::size_t count) {
    if (taken_ == 0 && count == bytes_.size()) return std::exchange(bytes_, {});
    const auto front = Front(count);
    ByteArray taken(front.begin(), front.end());
    DropFirst(count);
    return taken;
  }
  void Clear() {
    bytes_.clear();
    taken_ = 0;
  }

 private:
  ByteArray bytes_;
  std::size_t taken_ = 0;
};

} // namespace quendra::foundation
