#pragma once

#include "platform/capture/FrameBytes.h"
#include "runtime/Text.h"

namespace quendra::capture {

/// Decodes the link header of a frame. Texts are built when they are read, from copies of the bytes that they
/// show, so they hold when the frame is gone.
class clsEthernet {
 public:
  /// The last byte that Decode consumed: 13, or 21 with the three bytes of the logical link.
  std::int16_t LastByte() const { return LastByte_; }
  /// Where the addresses begin. The type code stays where it is.
  void start(std::int16_t index) { start_ = index; }
  /// A frame of 22 bytes or fewer changes nothing: every field keeps what the frame before left.
  void Decode(const platform::FrameBytes& frame);
  /// Decimal text of the signed value.
  Text TypeCode() const { return DecimalText(TypeCode_); }
  Text SourceMAC() const { return SourceMAC_.AsText(); }
  Text DestinationMAC() const { return DestinationMAC_.AsText(); }
  /// The label of the type code; empty before the first frame.
  Text TypeCodeString() const;

  /// What TypeCode reads, as a number.
  std::int16_t TypeCodeNumber() const { return TypeCode_; }

 private:
  struct MAC {
    enum { NotDecoded, OutsideFrame, Known } state = NotDecoded;
    std::array<std::uint8_t, 6> bytes{};

    void CopyFrom(const platform::FrameBytes& frame, std::int16_t first);
    Text AsText() const;
  };

  Text LogicalLinkLabel() const;

  MAC DestinationMAC_;
  MAC SourceMAC_;
  std::int16_t TypeCode_ = 0;
  bool labelled_ = false;
  std::int16_t start_ = 0;
  std::int16_t LastByte_ = 0;
  std::uint8_t destinationService_ = 0;
  std::uint8_t sourceService_ = 0;
  std::uint8_t control_ = 0;
};

} // namespace quendra::capture
