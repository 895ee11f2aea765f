#pragma once

#include "runtime/ByteFields.h"

#include <array>
#include <cstdint>

/// The layout of captured frames and of the capture control's records.
namespace quendra::platform {

/// Type codes of frames.
enum FrameType : int { kIpv4Frame = 0x0800, kArpFrame = 0x0806, kIpv6Frame = 0x86DD, kPppFrame = 0x880B };

inline constexpr std::size_t kEthernetHeaderBytes = 14;
/// A link pads what is shorter.
inline constexpr std::size_t kShortestFrameBytes = 60;
/// What a call for a frame gives when none waits.
inline constexpr std::array<std::uint8_t, kShortestFrameBytes> kBlankFrame{};

/// The header of a capture record, in host order: where its fields stand.
namespace capture_record {
inline constexpr int kSeconds = 0;
inline constexpr int kMicroseconds = 4;
inline constexpr int kCapturedLength = 8;
inline constexpr int kLengthOnWire = 12;
inline constexpr int kHeaderLength = 16; ///< 16 bits; the frame begins where it says
inline constexpr std::uint16_t kBytes = 18;
} // namespace capture_record

/// What a backend tells of a record.
struct CaptureRecordHeader {
  std::uint32_t seconds = 0;
  std::uint32_t microseconds = 0;
  std::uint32_t capturedLength = 0;
  std::uint32_t lengthOnWire = 0;
  std::uint16_t headerLength = capture_record::kBytes;

  std::array<std::uint8_t, capture_record::kBytes> Bytes() const {
    std::array<std::uint8_t, capture_record::kBytes> bytes{};
    PutLittle32(bytes, capture_record::kSeconds, seconds);
    PutLittle32(bytes, capture_record::kMicroseconds, microseconds);
    PutLittle32(bytes, capture_record::kCapturedLength, capturedLength);
    PutLittle32(bytes, capture_record::kLengthOnWire, lengthOnWire);
    PutLittle16(bytes, capture_record::kHeaderLength, headerLength);
    return bytes;
  }
};

} // namespace quendra::platform
