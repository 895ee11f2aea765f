#include "capture/PacketAttribution.h"

#include "capture/Kilobytes.h"
#include "capture/Protocols.h"
#include "capture/mod_get_header.h"
#include "capture/mod_get_proto.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessTable.h"

namespace quendra::capture {

PacketAttribution::PacketAttribution(platform::CaptureLibrary& library, forms::MessageLoop& loop,
                                     PacketControl& control, const OwnAddresses& addresses,
                                     monitor::ProcessTable& table)
    : library_(library), loop_(loop), control_(control), addresses_(addresses), table_(table),
      ports_(table.List()) {
  control_.vpacket_PacketReceived = [this] { vpacket_PacketReceived(); };
}

void PacketAttribution::vpacket_PacketReceived() {
  loop_.DoEvents();
  if (!table_.PageIsOpen()) return;
  const std::optional<int> newest = PeekProtocol();
  if (newest == kTcp || newest == kGre) Drain(newest == kGre);
}

/// The protocol of the newest record; nothing for a record whose headers lie beyond the buffer.
std::optional<int> PacketAttribution::PeekProtocol() {
  platform::CaptureControl& vpacket = control_.Get();
  PeekBytes_.fill(0);
  vpacket.ReadBuffer(PeekBytes_);
  const platform::FrameBytes record(PeekBytes_.data(), static_cast<int>(PeekBytes_.size()));
  try {
    std::int32_t index = mod_get_header::ReadCaptureHeader(record).headerLength;
    mod_get_header::ReadEthernetHeader(record, index);
    return mod_get_proto::ReadIpHeader(record, index).protocol;
  } catch (const Fault& fault) {
    CountIfMalformed(fault);
    return {};
  }
}

void PacketAttribution::Drain(bool tunnelled) {
  FrameDecoders decoders;
  platform::FrameBytes frame;
  platform::CaptureHeader header{};
  std::int32_t n = 1;
  while (n > 0) {
    loop_.DoEvents();
    n = library_.vpCapture(frame, header);
    const Verdict verdict = Decode(frame, decoders, tunnelled);
    if (verdict == Verdict::Malformed) return;
    if (verdict == Verdict::EndDrain) n = 0;
    if (verdict == Verdict::Charge) ChargePacket(decoders);
    table_.RefreshWhenDue();
    // The bytes of this round are gone with the next call; a call that delivers nothing must not show them
    // again.
    frame = platform::FrameBytes::Blank();
  }
}

PacketAttribution::Verdict PacketAttribution::Decode(const platform::FrameBytes& frame,
                                                     FrameDecoders& decoders, bool tunnelled) {
  try {
    return DecodeHeaders(frame, decoders, tunnelled);
  } catch (const Fault& fault) {
    CountIfMalformed(fault);
    return Verdict::Malformed;
  }
}

/// For handlers of a fault: one of bounds is counted, any other goes on its way.
void PacketAttribution::CountIfMalformed(const Fault& fault) {
  if (fault.number != Fault::kSubscript) throw;
  ++malformedFrames_;
}

PacketAttribution::Verdict PacketAttribution::DecodeHeaders(const platform::FrameBytes& frame,
                                                            FrameDecoders& decoders, bool tunnelled) {
  decoders.ethernet.Decode(frame);
  const int type = decoders.ethernet.TypeCodeNumber();
  if (type != kIpv4Frame && type != kArpFrame) return Verdict::EndDrain;
  decoders.ip.Decode(frame);
  switch (decoders.ip.Protocol()) {
  case kIcmp:
  case kUdp: return Verdict::EndDrain;
  case kTcp: break;
  default: return Verdict::PassOver;
  }
  decoders.tcp.Decode(frame, 4 * decoders.ip.TotalLength(), tunnelled);
  return Verdict::Charge;
}

void PacketAttribution::AttributePolledFrame(const platform::FrameBytes& frame, FrameDecoders& decoders) {
  try {
    decoders.ethernet.Decode(frame);
    if (decoders.ethernet.TypeCodeNumber() != kIpv4Frame) return;
    decoders.ip.Decode(frame);
    if (decoders.ip.Protocol() != kTcp) return;
    decoders.tcp.Decode(frame, 4 * decoders.ip.TotalLength(), true);
  } catch (const Fault& fault) {
    CountIfMalformed(fault);
    return;
  }
  ChargePacket(decoders);
}

bool PacketAttribution::IsOutgoing(const clsIP& ip) {
  const platform::Ipv4Address source = *ip.SourceAddress();
  return lastAddress_.Equals(addresses_.LocalAddressLast, source) ||
         previousAddress_.Equals(addresses_.LocalAddressPrevious, source);
}

void PacketAttribution::ChargePacket(const FrameDecoders& decoders) {
  const bool outgoing = IsOutgoing(decoders.ip);
  const std::int32_t port = outgoing ? decoders.tcp.SourcePort() : decoders.tcp.DestinationPort();
  forms::ListRow* row = ports_.RowOf(static_cast<std::int16_t>(port));
  if (!row) return;
  AddBytes(row->CellTag(outgoing ? monitor::kUploadCell : monitor::kDownloadCell), decoders.ip.TotalLength());
}

} // namespace quendra::capture
