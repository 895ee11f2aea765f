#pragma once

#include "platform/capture/FrameBytes.h"
#include "platform/net/Ipv4Address.h"
#include "runtime/Text.h"

#include <optional>

namespace quendra::capture {

/// Decodes the IPv4 header of a frame at fixed positions, 40 bytes further on when byte 23 says that the
/// frame is a tunnel's. A frame that ends too soon raises fault 9; the fields before the missing byte are the
/// frame's then, those after it are still the ones of the frame before.
class clsIP {
 public:
  /// Always 0: options aren't honoured.
  std::int32_t Options() const { return 0; }
  Text DestIP() const { return AddressText(DestIP_); }
  Text SrcIP() const { return AddressText(SrcIP_); }
  Text HD_Cheksum() const;
  std::int16_t Protocol() const { return Protocol_; }
  std::int16_t TTL() const { return TTL_; }
  std::int16_t FragmentOffset() const { return FragmentOffset_; }
  /// Made of positions, not of the frame's bytes: 4627, or 14907 in a tunnel.
  std::int16_t Identification() const { return Identification_; }
  std::int16_t TotalLength() const { return TotalLength_; }
  std::uint8_t IHL() const { return IHL_; }
  std::uint8_t Ver() const { return Ver_; }
  /// The result is an empty text that nobody reads.
  Text Decode(const platform::FrameBytes& frame);
  Text sProtocol() const { return sProtocol_; }

  /// What SrcIP reads; nothing before the first frame.
  const std::optional<platform::Ipv4Address>& SourceAddress() const { return SrcIP_; }

 private:
  static Text AddressText(const std::optional<platform::Ipv4Address>& address);
  void ResolveProtocolName();

  std::uint8_t Ver_ = 0;
  std::uint8_t IHL_ = 0;
  std::int16_t TotalLength_ = 0;
  std::int16_t Identification_ = 0;
  std::int16_t FragmentOffset_ = 0;
  std::int16_t TTL_ = 0;
  std::int16_t Protocol_ = 0;
  const char16_t* sProtocol_ = u"";
  std::optional<std::int16_t> HD_Cheksum_;
  std::optional<platform::Ipv4Address> SrcIP_;
  std::optional<platform::Ipv4Address> DestIP_;
};

} // namespace quendra::capture
