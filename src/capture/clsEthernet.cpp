#include "capture/clsEthernet.h"

#include "capture/modVBPcap.h"
#include "runtime/Integers.h"

#include <algorithm>

namespace quendra::capture {

namespace {

constexpr int kLastTooShortBound = 21;
constexpr std::int16_t kLastLengthCode = 1500;

struct TypeLabel {
  std::uint16_t code;
  const char16_t* label;
};

// Codes with bit 15 set are negative in the 16-bit field, so they never pass the test for a type: their rows
// aren't reached.
constexpr std::array<TypeLabel, 8> kTypeLabels{{
    {0x0800, u"[IPv4]"},
    {0x0806, u"[Arp]"},
    {0x8035, u"[Rarp]"},
    {0x8137, u"[Novell Netware IPX]"},
    {0x86DD, u"[IPv6]"},
    {0x8037, u"[IPX]"},
    {0x809B, u"[Ethertalk]"},
    {0x814C, u"[SNMP over Ethernet]"},
}};

Text LabelOf(std::uint16_t code) {
  for (const TypeLabel& row : kTypeLabels)
    if (row.code == code) return row.label;
  return u" Unknown ->TypeCode: " + HexText(code);
}

} // namespace

void clsEthernet::MAC::CopyFrom(const platform::FrameBytes& frame, std::int16_t first) {
  state = modVBPcap::RunIsInside(frame, first, 5) ? Known : OutsideFrame;
  if (state == Known) std::copy_n(frame.Data() + first, bytes.size(), bytes.begin());
}

Text clsEthernet::MAC::AsText() const {
  if (state == NotDecoded) return {};
  if (state == OutsideFrame) return u"0";
  return modVBPcap::HexRun(platform::FrameBytes(bytes.data(), 6), 0, 5);
}

void clsEthernet::Decode(const platform::FrameBytes& frame) {
  if (frame.UpperBound() <= kLastTooShortBound) return;
  DestinationMAC_.CopyFrom(frame, start_);
  SourceMAC_.CopyFrom(frame, ToInt16(start_ + 6));
  TypeCode_ = modVBPcap::WordAt(frame, 12);
  labelled_ = true;
  LastByte_ = 13;
  if (TypeCode_ > kLastLengthCode) return;
  destinationService_ = frame[14];
  sourceService_ = frame[15];
  control_ = frame[16];
  LastByte_ = 21;
}

Text clsEthernet::TypeCodeString() const {
  if (!labelled_) return {};
  return TypeCode_ > kLastLengthCode ? LabelOf(static_cast<std::uint16_t>(TypeCode_)) : LogicalLinkLabel();
}

Text clsEthernet::LogicalLinkLabel() const {
  Text label = u"[Ethernet IEEE 802.3]";
  if (destinationService_ != sourceService_) return label;
  if (destinationService_ == 0xF0) label += u" [NETBIOS LLC Encapsulation]";
  if (destinationService_ == 0xFF) label += u" [IPX RAW 802.3 Encapsulation]";
  return label;
}

} // namespace quendra::capture
