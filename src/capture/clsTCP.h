#pragma once

#include "platform/capture/FrameBytes.h"
#include "runtime/Text.h"

namespace quendra::capture {

/// Decodes the TCP header of a frame at fixed positions. A frame that ends too soon raises fault 9; the
/// fields before the missing byte are the frame's then, those after it still the ones of the frame before.
class clsTCP {
 public:
  std::int16_t Protocol() const { return Protocol_; }
  void Protocol(std::int16_t number) { Protocol_ = number; }
  std::int32_t OptPad() const { return 0; }
  std::int16_t UrgentPointer() const { return UrgentPointer_; }
  std::int16_t HD_Checksum() const { return 0; }
  std::int16_t window() const { return window_; }
  std::uint8_t flags() const { return flags_; }
  std::uint8_t Reserved() const { return 0; }
  std::uint8_t dataoffset() const { return 0; }
  std::int32_t ackNumber() const { return ackNumber_; }
  std::int32_t seqNumber() const { return seqNumber_; }
  /// Decimal texts of the signed words: port 50000 reads -15536.
  Text dstPort() const { return DecimalText(dstPort_); }
  Text srcPort() const { return DecimalText(srcPort_); }
  Text flagString() const;
  /// The hint is ignored. A tunnelled frame is read 40 bytes further on, but only when its upper bound is 94
  /// or more: a shorter one gives ports of nothing in particular.
  void Decode(const platform::FrameBytes& frame, std::int32_t lengthHint, bool tunnelled);
  std::uint8_t HLEN() const { return HLEN_; }

  /// What srcPort and dstPort read, as numbers.
  std::int32_t SourcePort() const { return srcPort_; }
  std::int32_t DestinationPort() const { return dstPort_; }

 private:
  void BuildFlagString();

  std::int16_t Protocol_ = 6;
  std::int32_t srcPort_ = 0;
  std::int32_t dstPort_ = 0;
  std::int32_t seqNumber_ = 0;
  std::int32_t ackNumber_ = 0;
  std::uint8_t HLEN_ = 0;
  std::uint8_t flags_ = 0;
  std::int16_t window_ = 0;
  std::int16_t UrgentPointer_ = 0;
  std::uint8_t flagStringBits_ =
      0; ///< what flagString is made of: the flags of the last frame that was read whole
};

} // namespace quendra::capture
