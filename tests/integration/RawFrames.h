#pragma once

#include "runtime/ByteFields.h"

#include <algorithm>
#include <arpa/inet.h>
#include <cstdint>
#include <cstring>
#include <linux/if_packet.h>
#include <net/ethernet.h>
#include <net/if.h>
#include <stdexcept>
#include <string>
#include <sys/socket.h>
#include <unistd.h>
#include <vector>

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
  inet_pton(AF_INET, source, &packet[12]);
  inet_pton(AF_INET, target, &packet[16]);
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

/// One end of a link, through which frames are sent as they are.
class RawLink {
 public:
  explicit RawLink(const std::string& interface)
      : descriptor_(socket(AF_PACKET, SOCK_RAW | SOCK_CLOEXEC, 0)) {
    sockaddr_ll address{};
    address.sll_family = AF_PACKET;
    address.sll_ifindex = static_cast<int>(if_nametoindex(interface.c_str()));
    if (descriptor_ < 0 || bind(descriptor_, reinterpret_cast<sockaddr*>(&address), sizeof address) != 0)
      throw std::runtime_error("no raw link on " + interface);
  }
  ~RawLink() { close(descriptor_); }
  RawLink(const RawLink&) = delete;
  RawLink& operator=(const RawLink&) = delete;

  void Send(const Bytes& frame) {
    if (send(descriptor_, frame.data(), frame.size(), 0) != static_cast<ssize_t>(frame.size()))
      throw std::runtime_error("a frame couldn't be sent");
  }
  /// In one call, so that nothing comes between them.
  void SendTogether(std::vector<Bytes> frames) {
    std::vector<iovec> parts(frames.size());
    std::vector<mmsghdr> messages(frames.size());
    for (std::size_t i = 0; i < frames.size(); ++i) {
      parts[i] = {frames[i].data(), frames[i].size()};
      messages[i].msg_hdr.msg_iov = &parts[i];
      messages[i].msg_hdr.msg_iovlen = 1;
    }
    if (sendmmsg(descriptor_, messages.data(), static_cast<unsigned>(messages.size()), 0) !=
        static_cast<int>(frames.size()))
      throw std::runtime_error("frames couldn't be sent");
  }

 private:
  int descriptor_;
};

} // namespace quendra::integration
