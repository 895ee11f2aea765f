#include "platform/linux/icmp/RawEchoSocket.h"

#include <linux/icmp.h>
#include <sys/random.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

/// Nobody outside can guess it, so nobody can answer what they didn't see.
std::uint16_t RandomId() {
  std::uint16_t id = 0;
  return ::getrandom(&id, sizeof id, 0) == sizeof id ? id : static_cast<std::uint16_t>(::getpid());
}

/// Only what may be an answer is worth a place in the socket's buffer.
void KeepOnlyAnswers(int socket) {
  icmp_filter filter{};
  filter.data =
      ~(1u << ICMP_ECHOREPLY | 1u << ICMP_DEST_UNREACH | 1u << ICMP_TIME_EXCEEDED | 1u << ICMP_PARAMETERPROB);
  ::setsockopt(socket, SOL_RAW, ICMP_FILTER, &filter, sizeof filter);
}

} // namespace

RawEchoSocket::RawEchoSocket(Descriptor socket) : EchoSocket(std::move(socket)), id_(RandomId()) {
  KeepOnlyAnswers(Number());
}

EchoSocket::Reading RawEchoSocket::Read(const SentEcho& echo, EchoReply& answer) {
  std::array<std::uint8_t, 65536> packet;
  const ssize_t size = ::recv(Number(), packet.data(), packet.size(), 0);
  if (size < 0) return errno == EAGAIN ? Reading::Nothing : Reading::Foreign;
  const auto found = ReadEchoPacket({packet.data(), static_cast<std::size_t>(size)}, echo);
  if (!found) return Reading::Foreign;
  answer = *found;
  return Reading::Answer;
}

} // namespace quendra::platform::linux_
