#include "capture/dormant/Sniffer.h"

#include "capture/Kilobytes.h"
#include "capture/Protocols.h"
#include "capture/modVBPcap.h"
#include "capture/mod_functions.h"
#include "monitor/ProcessRow.h"

namespace quendra::capture {

namespace {

constexpr std::uint32_t kReadable = 1;
constexpr std::uint32_t kSocketMessage = 1025;
constexpr int kBufferSize = 2000;
constexpr int kInnerHeader = 36;

using modVBPcap::WordAt;

SniffedPacket::Ports PortsAt(const platform::FrameBytes& bytes, int index) {
  return {WordAt(bytes, index), WordAt(bytes, index + 2)};
}

} // namespace

SniffedPacket ReadSniffedPacket(std::span<const std::uint8_t, 2000> buffer) {
  const platform::FrameBytes bytes(buffer.data(), kBufferSize);
  SniffedPacket packet;
  packet.tunnelled = bytes[9] == kGre;
  const int header = packet.tunnelled ? kInnerHeader : 0;
  packet.source = platform::Ipv4Address::FromMemory(mod_functions::ReadBytes(bytes, header + 12, 4));
  const int protocol = bytes[header + 9];
  int headerSize = 20;
  switch (protocol) {
  case kIcmp: packet.protocolName = u"ICMP"; break;
  case kTcp:
    packet.protocolName = u"TCP";
    packet.ports = PortsAt(bytes, packet.tunnelled ? 56 : 20);
    headerSize = 40;
    break;
  case kGre:
    packet.protocolName = DecimalText(protocol);
    packet.ports = PortsAt(bytes, 28);
    break;
  case kUdp:
    packet.protocolName = u"UDP";
    packet.ports = PortsAt(bytes, 20);
    headerSize = 28;
    break;
  default: packet.protocolName = DecimalText(protocol);
  }
  packet.payloadSize = WordAt(bytes, header + 2) - headerSize;
  return packet;
}

void Sniffer::Antes(std::int32_t&, std::int32_t&, WindowHandle, std::uint32_t, std::uint32_t, std::uint32_t) {
}

void Sniffer::Despues(std::int32_t&, WindowHandle, std::uint32_t, std::uint32_t wParam,
                      std::uint32_t lParam) {
  if (lParam != kReadable) return;
  std::int32_t received = kBufferSize;
  while (received == kBufferSize) {
    std::array<std::uint8_t, kBufferSize> buffer{};
    received = sockets_.recv(platform::SocketHandle(wParam), buffer, 0);
    if (received > 0) Charge(ReadSniffedPacket(buffer));
  }
}

void Sniffer::Charge(const SniffedPacket& packet) {
  const bool outgoing = IsOutgoing(packet);
  forms::ListRow* row = OwnerOf(packet, outgoing);
  if (!row) row = main_ListView1_.Find(u"p-1");
  if (!row) return;
  AddBytes(row->CellTag(outgoing ? monitor::kUploadCell : monitor::kDownloadCell), packet.payloadSize);
}

bool Sniffer::IsOutgoing(const SniffedPacket& packet) const {
  const Text source = packet.source.AsText();
  return source == Trimmed(addresses_.LocalAddressLast) ||
         source == Trimmed(addresses_.LocalAddressPrevious) || source == Trimmed(addresses_.GatewayAddress);
}

forms::ListRow* Sniffer::OwnerOf(const SniffedPacket& packet, bool outgoing) {
  if (!packet.ports) return nullptr;
  const Text port = u"." + DecimalText(outgoing ? packet.ports->source : packet.ports->destination) + u".";
  for (int i = 1; i <= main_ListView1_.Count(); ++i) {
    forms::ListRow& row = main_ListView1_.Row(i);
    if (row.CellText(monitor::kPortsCell).find(port) != Text::npos) return &row;
  }
  return nullptr;
}

void Sniffer::DeselectAndCloseSockets() {
  for (const platform::SocketHandle socket : Sockets)
    sockets_.WSAAsyncSelect(socket, Window, kSocketMessage, 0);
  for (const platform::SocketHandle socket : Sockets) sockets_.closesocket(socket);
}

void Sniffer::Teardown() {
  if (!Active) return;
  main_Timer1_.Enabled = false;
  DeselectAndCloseSockets();
  if (sockets_.WSAIsBlocking()) sockets_.WSACancelBlockingCall();
  sockets_.WSACleanup();
  DeselectAndCloseSockets();
  if (Subclass) Subclass->UnSubclass();
  Subclass.reset();
  Active = false;
}

} // namespace quendra::capture
