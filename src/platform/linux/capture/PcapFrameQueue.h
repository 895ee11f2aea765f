#pragma once

#include <array>
#include <cstdint>
#include <memory>

namespace quendra::platform::linux_ {

/// A frame as it waits: when it came, how much of it is here, how long it was.
struct PcapRecord {
  /// A TCP header inside a tunnel ends at index 93, and frames that reach index 94 are taken for tunnelled;
  /// what lies behind is of no use to the decoders.
  static constexpr std::uint32_t kRoom = 96;

  std::uint32_t seconds;
  std::uint32_t microseconds;
  std::uint32_t captured;
  std::uint32_t wire;
  std::array<std::uint8_t, kRoom> bytes;
};
static_assert(sizeof(PcapRecord) == 112);

/// Frames on their way from the kernel's ring to the capture loop. Bounded; pages are touched only as far as
/// it fills. The frame popped last stays as it is until the next one is popped.
class PcapFrameQueue {
 public:
  static constexpr std::uint32_t kCapacity = 65536;

  PcapFrameQueue() : records_(new PcapRecord[kCapacity]) {}

  bool Empty() const { return head_ == tail_; }
  std::uint32_t Size() const { return tail_ - head_; }
  std::uint32_t Room() const { return kCapacity - 1 - Size(); }

  /// A record to be filled by the caller, which has seen to it that there is room.
  PcapRecord& Push() {
    newest_ = &records_[tail_++ % kCapacity];
    return *newest_;
  }
  /// nullptr when none waits.
  const PcapRecord* Pop() { return Empty() ? nullptr : &records_[head_++ % kCapacity]; }
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
  const PcapRecord* Newest() const { return newest_; }

 private:
  std::unique_ptr<PcapRecord[]> records_;
  std::uint32_t head_ = 0;
  std::uint32_t tail_ = 0;
  PcapRecord* newest_ = nullptr;
};

} // namespace quendra::platform::linux_
