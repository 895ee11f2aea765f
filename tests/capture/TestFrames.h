#pragma once

#include "platform/capture/FrameBytes.h"
#include "runtime/ByteFields.h"

#include <cstdint>
#include <cstdio>
#include <string>
#include <vector>

namespace quendra::capture {

using Bytes = std::vector<std::uint8_t>;

inline platform::FrameBytes FrameOf(const Bytes& bytes) {
  return platform::FrameBytes(bytes.data(), static_cast<int>(bytes.size()));
}

inline void PutAddress(Bytes& bytes, std::size_t index, const std::string& dotted) {
  unsigned part[4] = {};
  std::sscanf(dotted.c_str(), "%u.%u.%u.%u", &part[0], &part[1], &part[2], &part[3]);
  for (std::size_t i = 0; i < 4; ++i) bytes.at(index + i) = static_cast<std::uint8_t>(part[i]);
}

inline constexpr const char* kOwnAddress = "10.0.0.138";
inline constexpr const char* kServer = "192.0.2.80";

/// What a test says of a frame; `Build` makes its bytes.
struct TestFrame {
  int protocol = 6;
  std::string source = kOwnAddress;
  unsigned sourcePort = 1025;
  std::string destination = kServer;
  unsigned destinationPort = 80;
  unsigned totalLength = 1024;
  unsigned type = 0x0800;
  std::size_t size = 60;

  /// The packet's own bytes from `ip` on: an IPv4 header of 20 bytes and the ports.
  void PutPacket(Bytes& bytes, std::size_t ip) const {
    bytes.at(ip) = 0x45;
    PutBig16(bytes, ip + 2, totalLength);
    bytes.at(ip + 8) = 64;
    bytes.at(ip + 9) = static_cast<std::uint8_t>(protocol);
    PutAddress(bytes, ip + 12, source);
    PutAddress(bytes, ip + 16, destination);
    PutBig16(bytes, ip + 20, sourcePort);
    PutBig16(bytes, ip + 22, destinationPort);
  }

  Bytes Build() const {
    Bytes bytes(size);
    PutBig16(bytes, 12, type);
    PutPacket(bytes, 14);
    return bytes;
  }

  /// In a PPTP tunnel, 40 bytes further on.
  Bytes BuildTunnelled() const {
    Bytes bytes(size);
    PutBig16(bytes, 12, type);
    bytes.at(14) = 0x45;
    bytes.at(23) = 47;
    PutPacket(bytes, 54);
    return bytes;
  }
};

inline Bytes Outgoing(unsigned port, unsigned totalLength = 1024) {
  TestFrame frame;
  frame.sourcePort = port;
  frame.totalLength = totalLength;
  return frame.Build();
}

inline Bytes Incoming(unsigned port, unsigned totalLength = 1024) {
  TestFrame frame;
  frame.source = kServer;
  frame.sourcePort = 80;
  frame.destination = kOwnAddress;
  frame.destinationPort = port;
  frame.totalLength = totalLength;
  return frame.Build();
}

inline Bytes Udp() {
  TestFrame frame;
  frame.protocol = 17;
  return frame.Build();
}

inline Bytes Icmp() {
  TestFrame frame;
  frame.protocol = 1;
  return frame.Build();
}

} // namespace quendra::capture
