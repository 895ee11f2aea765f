#include "platform/linux/icmp/EchoSocket.h"

#include "platform/linux/icmp/PingEchoSocket.h"
#include "platform/linux/icmp/RawEchoSocket.h"
#include "platform/linux/net/SystemAddress.h"

#include <sys/socket.h>

#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint8_t kDontFragment = 2; // of the options' flags
constexpr int kSystemsOwn = -1;

Descriptor NewSocket(int type) {
  return Descriptor(::socket(AF_INET, type | SOCK_NONBLOCK | SOCK_CLOEXEC, IPPROTO_ICMP));
}

void SetIpOption(int socket, int option, int value) {
  ::setsockopt(socket, IPPROTO_IP, option, &value, sizeof value);
}

/// A TTL of 0 can't be sent here and stands for the system's own.
void SetOptions(int socket, std::span<const std::uint8_t> options) {
  const bool isGiven = options.size() >= kEchoOptionsSize;
  const int ttl = isGiven ? options[kOptionsTtl] : 0;
  const int flags = isGiven ? options[kOptionsFlags] : 0;
  SetIpOption(socket, IP_TTL, ttl > 0 ? ttl : kSystemsOwn);
  SetIpOption(socket, IP_TOS, isGiven ? options[kOptionsTos] : 0);
  SetIpOption(socket, IP_MTU_DISCOVER, (flags & kDontFragment) != 0 ? IP_PMTUDISC_DO : IP_PMTUDISC_DONT);
}

} // namespace

int EchoSocket::Send(const SentEcho& echo, std::span<const std::uint8_t> options) {
  Prepare();
  SetOptions(Number(), options);
  const auto message = EchoMessage(echo);
  const sockaddr_in target = SystemAddress({echo.target, 0});
  ssize_t sent = -1;
  do
    sent = ::sendto(Number(), message.data(), message.size(), 0, reinterpret_cast<const sockaddr*>(&target),
                    sizeof target);
  while (sent < 0 && errno == EINTR);
  return sent < 0 ? errno : 0;
}

OpenedEchoSocket OpenEchoSocket() {
  if (Descriptor raw = NewSocket(SOCK_RAW)) return {std::make_unique<RawEchoSocket>(std::move(raw)), false};
  const bool lacksRight = errno == EPERM || errno == EACCES;
  if (Descriptor ping = NewSocket(SOCK_DGRAM))
    return {std::make_unique<PingEchoSocket>(std::move(ping)), false};
  return {nullptr, lacksRight};
}

} // namespace quendra::platform::linux_
