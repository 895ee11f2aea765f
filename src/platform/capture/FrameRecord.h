#pragma once

#include <array>
#include <cstdint>

namespace quendra::platform {

/// A frame as it waits: when it came, how much of it is here, how long it was.
struct FrameRecord {
  /// A TCP header inside a tunnel ends at index 93, and frames that reach index 94 are taken for tunnelled;
  /// the decoders read nothing beyond.
  static constexpr std::uint32_t kRoom = 96;

  std::uint32_t seconds;
  std::uint32_t microseconds;
  std::uint32_t captured;
  std::uint32_t wire;
  std::array<std::uint8_t, kRoom> bytes;
};
static_assert(sizeof(FrameRecord) == 112);

} // namespace quendra::platform
