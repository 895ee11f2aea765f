#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

/// The layout of captured frames.
namespace quendra::platform {

/// Type codes of frames.
enum FrameType : int { kIpv4Frame = 0x0800, kArpFrame = 0x0806, kIpv6Frame = 0x86DD, kPppFrame = 0x880B };

inline constexpr std::size_t kEthernetHeaderBytes = 14;
/// A link pads what is shorter.
inline constexpr std::size_t kShortestFrameBytes = 60;
/// What a call for a frame gives when none waits.
inline constexpr std::array<std::uint8_t, kShortestFrameBytes> kBlankFrame{};

} // namespace quendra::platform
