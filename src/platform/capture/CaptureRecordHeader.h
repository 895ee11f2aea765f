#pragma once

#include "runtime/ByteFields.h"

#include <array>
#include <cstdint>

namespace quendra::platform {

/// The header of a capture record, low byte first: where its fields stand.
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
