#pragma once

#include "platform/capture/CaptureNumbers.h"
#include "runtime/Fault.h"

#include <cstdint>

namespace quendra::platform {

/// A frame as a capture loop sees it: bytes by index from 0, checked. The bytes belong to whoever delivered
/// them and hold until the next call for a frame. Starts as an array of two zero bytes.
class FrameBytes {
 public:
  FrameBytes() = default;
  FrameBytes(const std::uint8_t* bytes, int length) : bytes_(bytes), length_(length) {}

  /// The last valid index, -1 for a frame without bytes.
  int UpperBound() const { return length_ - 1; }
  /// Fault 9 beyond the bounds.
  std::uint8_t operator[](int index) const {
    if (static_cast<unsigned>(index) >= static_cast<unsigned>(length_)) throw Fault(Fault::kSubscript);
    return bytes_[index];
  }
  /// The bytes without a check, for those that have tested the bound.
  const std::uint8_t* Data() const { return bytes_; }

  /// What a call for a frame gives when none waits.
  static FrameBytes Blank() { return {kBlankFrame.data(), static_cast<int>(kBlankFrame.size())}; }

 private:
  static constexpr std::uint8_t kFresh[2] = {0, 0};
  const std::uint8_t* bytes_ = kFresh;
  int length_ = 2;
};

} // namespace quendra::platform
