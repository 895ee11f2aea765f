#pragma once

#include "platform/EventLoop.h"
#include "platform/capture/FrameShaper.h"

namespace quendra::platform {

/// A live capture on one adapter, which a backend opens. It delivers packets to the shaper that it was opened
/// with and has told it the form of its link. It ends with the object.
class FrameSource {
 public:
  virtual ~FrameSource() = default;

  /// The most packets that one call to Fill takes from the system: few enough to stay in the nearest caches
  /// until they are read.
  static constexpr int kBatch = 256;
  /// The room in the queue that a call to Fill may need.
  static constexpr std::uint32_t kRoomOfBatch = kBatch * FrameShaper::kMostPieces;

  /// Delivers what waits, at most kBatch packets, without waiting for more. The number of packets; below 0
  /// when the capture has failed, which nobody asks again then.
  virtual int Fill() = 0;
  /// How many packets the system has had no room for.
  virtual std::uint64_t Dropped() const = 0;
  /// Calls `ready` from the loop when packets may wait, again and again until the subscription goes, which is
  /// before the source does: as a descriptor tells, or at a pace that keeps the system's buffer from running
  /// over. `ready` may end the subscription, and the source with it.
  [[nodiscard]] virtual std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> ready) = 0;
};

} // namespace quendra::platform
