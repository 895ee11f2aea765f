#include "diagnostics/mdlPing.h"

#include "diagnostics/IcmpFile.h"
#include "platform/net/Sockets.h"
#include "runtime/ByteFields.h"

namespace quendra::diagnostics {

namespace {

constexpr std::array<std::uint8_t, 5> kPayload{'h', 'e', 'l', 'l', 'o'};
constexpr std::uint32_t kTimeLimit = 1000;

} // namespace

std::int32_t mdlPing::Ping(const Text& address, Reply& reply) {
  const platform::Ipv4Address target = platform::Sockets::inet_addr(ToCodePage(address));
  if (target == platform::kNoAddress || target.IsAny()) return kNotSent;
  IcmpFile file(icmp_);
  if (!file.IsOpen()) return kNotSent;
  file.SendEcho({target, kPayload, {}}, reply, kTimeLimit);
  return static_cast<std::int32_t>(Little32(reply, platform::kReplyStatus));
}

} // namespace quendra::diagnostics
