#pragma once

#include "platform/icmp/EchoReply.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace quendra::platform::linux_ {

/// An echo that was sent, by all that an answer can be told by.
struct SentEcho {
  Ipv4Address target;
  std::uint16_t id = 0;
  std::uint16_t sequence = 0;
  std::span<const std::uint8_t> data;
};

inline constexpr std::size_t kEchoHeaderSize = 8;

/// The message that asks for it, with its checksum.
std::vector<std::uint8_t> EchoMessage(const SentEcho& echo);

// Whatever comes from the network may be forged, cut or meant for somebody else: each of these gives an
// answer only for what is whole and belongs to the echo.

/// From a packet as a raw socket receives it, with its IP header and an unverified checksum: the reply, or
/// the message of a router that quotes the echo.
std::optional<EchoReply> ReadEchoPacket(std::span<const std::uint8_t> packet, const SentEcho& echo);
/// Whether a message without IP header is the reply.
bool IsReplyTo(std::span<const std::uint8_t> message, const SentEcho& echo);
/// Whether a message without IP header, as an error quotes it, begins as the echo does.
bool IsBeginOf(std::span<const std::uint8_t> message, const SentEcho& echo);
/// The status that an ICMP error stands for; nothing for a message that ends no echo.
std::optional<std::uint32_t> EchoStatusOf(std::uint8_t type, std::uint8_t code);

} // namespace quendra::platform::linux_
