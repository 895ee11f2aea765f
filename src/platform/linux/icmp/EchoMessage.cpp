#include "platform/linux/icmp/EchoMessage.h"

#include "platform/icmp/IcmpNumbers.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

using Bytes = std::span<const std::uint8_t>;

// Types of messages.
constexpr std::uint8_t kReply = 0;
constexpr std::uint8_t kUnreachable = 3;
constexpr std::uint8_t kRequest = 8;
constexpr std::uint8_t kTimeExceeded = 11;
constexpr std::uint8_t kParameterProblem = 12;

constexpr std::uint8_t kIcmpProtocol = 1;
constexpr std::size_t kShortestIpHeader = 20;

std::uint16_t Checksum(Bytes bytes) {
  std::uint32_t sum = 0;
  for (std::size_t at = 0; at + 1 < bytes.size(); at += 2) sum += Big16(bytes, at);
  if (bytes.size() % 2 != 0) sum += static_cast<std::uint32_t>(bytes.back() << 8);
  while (sum > 0xFFFF) sum = (sum & 0xFFFF) + (sum >> 16);
  return static_cast<std::uint16_t>(~sum);
}

/// What an IP header is asked for, and the bytes behind it as far as they are there.
struct IpPacket {
  std::uint8_t tos = 0;
  std::uint8_t ttl = 0;
  std::uint8_t protocol = 0;
  bool isFirstFragment = false;
  Ipv4Address source;
  Ipv4Address target;
  std::size_t statedSize = 0; ///< of what is behind the header
  Bytes payload;
};

std::optional<IpPacket> ReadIpPacket(Bytes bytes) {
  if (bytes.size() < kShortestIpHeader || bytes[0] >> 4 != 4) return {};
  const std::size_t headerSize = (bytes[0] & 0xFu) * 4;
  const std::size_t totalSize = Big16(bytes, 2);
  if (headerSize < kShortestIpHeader || headerSize > bytes.size() || totalSize < headerSize) return {};
  const std::size_t statedSize = totalSize - headerSize;
  return IpPacket{.tos = bytes[1],
                  .ttl = bytes[8],
                  .protocol = bytes[9],
                  .isFirstFragment = (Big16(bytes, 6) & 0x1FFF) == 0,
                  .source = Ipv4Address::FromMemory(Little32(bytes, 12)),
                  .target = Ipv4Address::FromMemory(Little32(bytes, 16)),
                  .statedSize = statedSize,
                  .payload = bytes.subspan(headerSize, std::min(statedSize, bytes.size() - headerSize))};
}

bool HasOwnNumbers(Bytes message, const SentEcho& echo) {
  return Big16(message, 4) == echo.id && Big16(message, 6) == echo.sequence;
}

/// A router quotes the IP header and as much of the message as it likes, at least eight bytes.
bool QuotesEcho(Bytes quoted, const SentEcho& echo) {
  const auto packet = ReadIpPacket(quoted);
  return packet && packet->protocol == kIcmpProtocol && packet->isFirstFragment &&
         packet->target == echo.target && packet->statedSize == kEchoHeaderSize + echo.data.size() &&
         IsBeginOf(packet->payload, echo);
}

} // namespace

std::vector<std::uint8_t> EchoMessage(const SentEcho& echo) {
  std::vector<std::uint8_t> message(kEchoHeaderSize + echo.data.size());
  message[0] = kRequest;
  PutBig16(message, 4, echo.id);
  PutBig16(message, 6, echo.sequence);
  std::copy(echo.data.begin(), echo.data.end(), message.begin() + kEchoHeaderSize);
  PutBig16(message, 2, Checksum(message));
  return message;
}

std::optional<EchoReply> ReadEchoPacket(Bytes bytes, const SentEcho& echo) {
  const auto packet = ReadIpPacket(bytes);
  if (!packet || packet->protocol != kIcmpProtocol) return {};
  const Bytes message = packet->payload;
  if (message.size() < kEchoHeaderSize || message.size() != packet->statedSize || Checksum(message) != 0)
    return {};
  EchoReply reply{packet->source, kEchoSuccess, 0, packet->ttl, packet->tos, {}};
  if (IsReplyTo(message, echo)) {
    const Bytes data = message.subspan(kEchoHeaderSize);
    reply.data.assign(data.begin(), data.end());
    return reply;
  }
  const auto status = EchoStatusOf(message[0], message[1]);
  if (!status || !QuotesEcho(message.subspan(kEchoHeaderSize), echo)) return {};
  reply.status = *status;
  return reply;
}

bool IsReplyTo(Bytes message, const SentEcho& echo) {
  if (message.size() < kEchoHeaderSize || message[0] != kReply || message[1] != 0) return false;
  const Bytes data = message.subspan(kEchoHeaderSize);
  return HasOwnNumbers(message, echo) &&
         std::equal(data.begin(), data.end(), echo.data.begin(), echo.data.end());
}

bool IsBeginOf(Bytes message, const SentEcho& echo) {
  if (message.size() < kEchoHeaderSize || message[0] != kRequest || message[1] != 0) return false;
  const Bytes data = message.subspan(kEchoHeaderSize);
  return HasOwnNumbers(message, echo) && data.size() <= echo.data.size() &&
         std::equal(data.begin(), data.end(), echo.data.begin());
}

std::optional<std::uint32_t> EchoStatusOf(std::uint8_t type, std::uint8_t code) {
  if (type == kTimeExceeded) return code == 0 ? kEchoTtlExpiredInTransit : kEchoTtlExpiredInReassembly;
  if (type == kParameterProblem) return kEchoParameterProblem;
  if (type != kUnreachable) return {};
  switch (code) {
  case 0:  // network
  case 6:  // network unknown
  case 9:  // network prohibited
  case 11: // network, for this service
    return kEchoNetUnreachable;
  case 2: return kEchoProtocolUnreachable;
  case 3: return kEchoPortUnreachable;
  case 4: return kEchoPacketTooBig;
  default: return kEchoHostUnreachable;
  }
}

} // namespace quendra::platform::linux_
