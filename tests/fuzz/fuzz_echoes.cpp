// Any bytes as what comes back for an echo: a packet of a raw socket, a message of a ping socket, a quote.

#include "platform/icmp/IcmpNumbers.h"
#include "platform/linux/icmp/EchoMessage.h"

#include <array>
#include <cstdlib>

namespace {

using namespace quendra;
using namespace quendra::platform;
using namespace quendra::platform::linux_;

void Require(bool holds) {
  if (!holds) std::abort();
}

void ReadPacket(std::span<const std::uint8_t> packet, const SentEcho& echo) {
  const auto reply = ReadEchoPacket(packet, echo);
  if (!reply) return;
  // Whatever is taken has room for its headers, and a reply has the echo's data whole.
  Require(packet.size() >= 20 + kEchoHeaderSize);
  if (reply->status == kEchoSuccess)
    Require(std::equal(reply->data.begin(), reply->data.end(), echo.data.begin(), echo.data.end()));
  else
    Require(reply->data.empty() && packet.size() >= 20 + kEchoHeaderSize + 20 + kEchoHeaderSize);
  std::array<std::uint8_t, 40> record;
  Require(PutEchoReply(record, *reply));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::array<std::uint8_t, 5> sent{'h', 'e', 'l', 'l', 'o'};
  const SentEcho echo{Ipv4Address::FromHost(0x0A000001), 0x1234, 1, sent};
  const std::span<const std::uint8_t> bytes(data, size);
  ReadPacket(bytes, echo);
  if (IsReplyTo(bytes, echo)) Require(size == kEchoHeaderSize + sent.size());
  if (IsBeginOf(bytes, echo)) Require(size >= kEchoHeaderSize && size <= kEchoHeaderSize + sent.size());
  return 0;
}
