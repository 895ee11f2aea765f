#pragma once

#include "platform/capture/FrameQueue.h"
#include "platform/capture/LinkForm.h"

#include <cstdint>
#include <span>

namespace quendra::platform {

struct PacketTimes {
  std::uint32_t seconds = 0;
  std::uint32_t microseconds = 0;
};

/// Puts packets of a link into the queue as Ethernet frames: with a header of 14 bytes where the link has
/// none, with zero bytes after the end of those shorter than 60, and an IPv4 TCP packet that the host's
/// segmentation offload made longer than the decoders' signed 16 bits as several frames, whose IP total
/// lengths add up to the packet's.
class FrameShaper {
 public:
  /// A record of a packet yields at most so many frames.
  static constexpr std::uint32_t kMostPieces = 17;
  /// So many bytes is an Ethernet header shorter than the longest header that it replaces.
  static constexpr std::uint32_t kMostHeaderLost = 6;
  /// A frame has room for the first so many bytes of a packet, on whatever link.
  static constexpr std::uint32_t kMostBytes = FrameRecord::kRoom + kMostHeaderLost;

  explicit FrameShaper(FrameQueue& queue) : queue_(queue) {}
  void SetForm(LinkForm form) { form_ = form; }

  /// `packet` are the captured bytes, `wire` is the packet's length on the link. The queue has room for
  /// kMostPieces.
  void Deliver(PacketTimes times, std::span<const std::uint8_t> packet, std::uint32_t wire);

 private:
  void SplitOversized(FrameRecord& first);

  FrameQueue& queue_;
  LinkForm form_ = LinkForm::Ethernet;
};

} // namespace quendra::platform
