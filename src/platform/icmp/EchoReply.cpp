#include "platform/icmp/EchoReply.h"

#include "platform/icmp/IcmpNumbers.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform {

bool PutEchoReply(std::span<std::uint8_t> buffer, const EchoReply& reply) {
  if (buffer.size() < kEchoReplySize) return false;
  std::fill_n(buffer.begin(), kEchoReplySize, std::uint8_t{0});
  const std::size_t kept = std::min({reply.data.size(), buffer.size() - kEchoReplySize, std::size_t{0xFFFF}});
  PutLittle32(buffer, kReplyAddress, reply.address.InMemory());
  PutLittle32(buffer, kReplyStatus, reply.status);
  PutLittle32(buffer, kReplyRoundTripTime, reply.roundTripTime);
  PutLittle16(buffer, kReplyDataSize, static_cast<std::uint16_t>(kept));
  buffer[kReplyTtl] = reply.ttl;
  buffer[kReplyTos] = reply.tos;
  std::copy_n(reply.data.begin(), kept, buffer.begin() + kEchoReplySize);
  return true;
}

bool PutEchoFailure(std::span<std::uint8_t> buffer, std::uint32_t status) {
  EchoReply none;
  none.status = status;
  return PutEchoReply(buffer, none);
}

} // namespace quendra::platform
