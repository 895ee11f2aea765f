#pragma once

#include "platform/net/Ipv4Address.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <cstdint>
#include <string_view>
#include <vector>

/// Packets and frames made up by tests, on any system.
namespace quendra::integration {

using Bytes = std::vector<std::uint8_t>;

/// An IPv4 packet of `total` bytes with the two ports after its header; the payload is zeros.
inline Bytes Ipv4Packet(int protocol, const char* source, unsigned sourcePort, const char* target,
                        unsigned targetPort, std::size_t total = 40) {
  Bytes packet(total);
  packet[0] = 0x45;
  PutBig16(packet, 2, static_cast<unsigned>(total));
  packet[8] = 64;
  packet[9] = static_cast<std::uint8_t>(protocol);
  PutLittle32(packet, 12, platform::Ipv4Address::FromText(std::string_view(source))->InMemory());
  PutLittle32(packet, 16, platform::Ipv4Address::FromText(std::string_view(target))->InMemory());
  if (total >= 24) {
    PutBig16(packet, 20, sourcePort);
    PutBig16(packet, 22, targetPort);
  }
  if (protocol == 6 && total >= 40) {
    packet[32] = 0x50;
    packet[33] = 0x10;
  }
  return packet;
}

inline Bytes Joined(const Bytes& front, const Bytes& back) {
  Bytes all(front.size() + back.size());
  std::copy(front.begin(), front.end(), all.begin());
  std::copy(back.begin(), back.end(), all.begin() + static_cast<std::ptrdiff_t>(front.size()));
  return all;
}

/// With an Ethernet header of made-up addresses.
inline Bytes EthernetFrame(const Bytes& packet, unsigned type = 0x0800) {
  Bytes header = {2, 0, 0, 0, 0, 1, 2, 0, 0, 0, 0, 2, 0, 0};
  PutBig16(header, 12, type);
  return Joined(header, packet);
}

inline Bytes TcpFrame(unsigned sourcePort, unsigned targetPort, std::size_t total = 40) {
  return EthernetFrame(Ipv4Packet(6, "10.9.0.2", sourcePort, "10.9.0.1", targetPort, total));
}
inline Bytes UdpFrame(unsigned sourcePort, unsigned targetPort, std::size_t total = 40) {
  return EthernetFrame(Ipv4Packet(17, "10.9.0.2", sourcePort, "10.9.0.1", targetPort, total));
}

} // namespace quendra::integration
