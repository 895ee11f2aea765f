#include "platform/capture/FrameShaper.h"

#include "platform/capture/CaptureNumbers.h"
#include "platform/net/IpProtocols.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <cstring>

namespace quendra::platform {

namespace {

constexpr std::uint32_t kEthernetHeader = kEthernetHeaderBytes;
constexpr std::uint32_t kShortestFrame = kShortestFrameBytes;
constexpr std::uint32_t kLargestTotal = 32767;
constexpr std::uint16_t kTypeIpv4 = kIpv4Frame;
constexpr std::uint16_t kTypeIpv6 = kIpv6Frame;
constexpr std::uint16_t kTypePpp = kPppFrame;

/// 0 beyond the packet.
std::uint16_t WordAt(std::span<const std::uint8_t> packet, std::size_t index) {
  return index + 1 < packet.size() ? Big16(packet, index) : 0;
}

std::uint16_t TypeByVersion(std::span<const std::uint8_t> packet) {
  const int version = packet.empty() ? 0 : packet[0] >> 4;
  return version == 4 ? kTypeIpv4 : version == 6 ? kTypeIpv6 : 0;
}

/// Where the packet begins after its link's own header, and what it is.
struct Payload {
  std::size_t offset = 0;
  std::uint16_t type = 0;
};

Payload PppPayload(std::span<const std::uint8_t> packet) {
  std::size_t offset = WordAt(packet, 0) == 0xFF03 ? 2 : 0;
  const bool compressed = offset < packet.size() && (packet[offset] & 1);
  const std::uint16_t protocol = compressed ? packet[offset] : WordAt(packet, offset);
  offset += compressed ? 1 : 2;
  return {offset, protocol == 0x21 ? kTypeIpv4 : protocol == 0x57 ? kTypeIpv6 : kTypePpp};
}

Payload PayloadOf(LinkForm form, std::span<const std::uint8_t> packet) {
  switch (form) {
  case LinkForm::Family: return {4, TypeByVersion(packet.subspan(std::min<std::size_t>(4, packet.size())))};
  case LinkForm::LinuxCooked: return {16, WordAt(packet, 14)};
  case LinkForm::LinuxCooked2: return {20, WordAt(packet, 0)};
  case LinkForm::Ppp: return PppPayload(packet);
  default: return {0, TypeByVersion(packet)};
  }
}

void FillEthernet(FrameRecord& record, std::span<const std::uint8_t> packet, std::uint32_t wire) {
  record.captured = static_cast<std::uint32_t>(std::min<std::size_t>(packet.size(), FrameRecord::kRoom));
  record.wire = wire;
  std::copy_n(packet.begin(), record.captured, record.bytes.begin());
}

/// The link's own header gives way to an Ethernet header without addresses.
void FillOther(FrameRecord& record, LinkForm form, std::span<const std::uint8_t> packet, std::uint32_t wire) {
  const Payload payload = PayloadOf(form, packet);
  const std::size_t skipped = std::min(payload.offset, packet.size());
  const std::size_t length =
      std::min<std::size_t>(packet.size() - skipped, FrameRecord::kRoom - kEthernetHeader);
  std::memset(record.bytes.data(), 0, 12);
  PutBig16(record.bytes, 12, payload.type);
  const auto payloadBytes = packet.subspan(skipped, length);
  std::copy(payloadBytes.begin(), payloadBytes.end(), record.bytes.begin() + kEthernetHeader);
  record.captured = static_cast<std::uint32_t>(kEthernetHeader + length);
  record.wire = std::max<std::uint32_t>(wire, static_cast<std::uint32_t>(skipped)) -
                static_cast<std::uint32_t>(skipped) + kEthernetHeader;
}

/// What the packet's frames have to add up to; 0 when it can stay one frame. A total length that the frame
/// doesn't have is a lie of the sender and stays one frame too.
std::uint32_t OversizedTotal(const FrameRecord& record) {
  const auto& bytes = record.bytes;
  if (Big16(bytes, 12) != kIpv4Frame || bytes[14] >> 4 != 4 || bytes[23] != kTcp) return 0;
  const std::uint32_t present = record.wire - kEthernetHeader;
  const std::uint32_t told = Big16(bytes, 16);
  // A packet beyond 64 KB has no room for its length in the header, which reads 0 then.
  if (told == 0 && present > 0xFFFF) return present;
  return told > kLargestTotal && told <= present ? told : 0;
}

void SetTotalLength(FrameRecord& record, std::uint32_t total) {
  PutBig16(record.bytes, 16, static_cast<std::uint16_t>(total));
  record.wire = kEthernetHeader + total;
}

} // namespace

void FrameShaper::Deliver(PacketTimes times, std::span<const std::uint8_t> packet, std::uint32_t wire) {
  FrameRecord& record = queue_.Push();
  record.seconds = times.seconds;
  record.microseconds = times.microseconds;
  if (form_ == LinkForm::Ethernet)
    FillEthernet(record, packet, wire);
  else
    FillOther(record, form_, packet, wire);
  if (record.captured < kShortestFrame) {
    std::memset(record.bytes.data() + record.captured, 0, kShortestFrame - record.captured);
    record.captured = kShortestFrame;
  }
  if (record.wire > kEthernetHeader + kLargestTotal) SplitOversized(record);
}

void FrameShaper::SplitOversized(FrameRecord& first) {
  std::uint32_t left = OversizedTotal(first);
  if (left == 0 || left > kMostPieces * kLargestTotal) return;
  const FrameRecord whole = first;
  SetTotalLength(first, std::min(left, kLargestTotal));
  for (left -= std::min(left, kLargestTotal); left > 0; left -= std::min(left, kLargestTotal)) {
    FrameRecord& next = queue_.Push();
    next = whole;
    SetTotalLength(next, std::min(left, kLargestTotal));
  }
}

} // namespace quendra::platform
