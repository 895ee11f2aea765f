#pragma once

#include "platform/capture/FrameRecord.h"

#include <bit>
#include <memory>

namespace quendra::platform {

/// Frames on their way from the system to the capture loop. Bounded; pages are touched only as far as it
/// fills. The frame popped last stays as it is until the next one is popped.
class FrameQueue {
 public:
  static constexpr std::uint32_t kUsualCapacity = 65536;

  /// The capacity is rounded up to a power of two.
  explicit FrameQueue(std::uint32_t capacity = kUsualCapacity)
      : mask_(std::bit_ceil(capacity) - 1), records_(new FrameRecord[mask_ + std::size_t{1}]) {}

  std::uint32_t Capacity() const { return mask_ + 1; }
  bool Empty() const { return head_ == tail_; }
  std::uint32_t Size() const { return tail_ - head_; }
  /// One place stays free, that of the frame popped last.
  std::uint32_t Room() const { return mask_ - Size(); }

  /// A record to be filled by the caller, which has seen to it that there is room.
  FrameRecord& Push() {
    newest_ = &records_[tail_++ & mask_];
    return *newest_;
  }
  /// nullptr when none waits.
  const FrameRecord* Pop() { return Empty() ? nullptr : &records_[head_++ & mask_]; }
  void DiscardOldest(std::uint32_t count) { head_ += count; }

  /// Lets an empty queue start at its first record again, which keeps what is in use small enough for the
  /// caches.
  void Rewind() {
    if (Empty()) head_ = tail_ = 0;
  }
  void Clear() {
    head_ = tail_ = 0;
    newest_ = nullptr;
  }

  /// The record pushed last, popped or not; nullptr before the first.
  const FrameRecord* Newest() const { return newest_; }

 private:
  const std::uint32_t mask_;
  std::unique_ptr<FrameRecord[]> records_;
  std::uint32_t head_ = 0;
  std::uint32_t tail_ = 0;
  FrameRecord* newest_ = nullptr;
};

} // namespace quendra::platform
