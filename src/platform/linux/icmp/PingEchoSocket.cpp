#include "platform/linux/icmp/PingEchoSocket.h"

#include "platform/icmp/IcmpNumbers.h"

#include <linux/errqueue.h>
#include <netinet/in.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>
#include <cstring>

namespace quendra::platform::linux_ {

namespace {

/// One message with what the system tells beside it.
class Message {
 public:
  bool Receive(int socket, int flags) {
    iovec part{bytes_.data(), bytes_.size()};
    header_.msg_name = &sender_;
    header_.msg_namelen = sizeof sender_;
    header_.msg_iov = &part;
    header_.msg_iovlen = 1;
    header_.msg_control = control_.data();
    header_.msg_controllen = control_.size();
    const ssize_t size = ::recvmsg(socket, &header_, flags);
    size_ = size < 0 ? 0 : static_cast<std::size_t>(size);
    return size >= 0;
  }
  std::span<const std::uint8_t> Bytes() const { return {bytes_.data(), size_}; }
  Ipv4Address Sender() const { return Ipv4Address::FromMemory(sender_.sin_addr.s_addr); }

  /// The part of that kind; false when there is none, or less than that.
  bool Beside(int kind, void* into, std::size_t size) {
    for (cmsghdr* part = CMSG_FIRSTHDR(&header_); part != nullptr; part = CMSG_NXTHDR(&header_, part)) {
      if (part->cmsg_level != IPPROTO_IP || part->cmsg_type != kind) continue;
      if (part->cmsg_len < CMSG_LEN(size)) return false;
      std::memcpy(into, CMSG_DATA(part), size);
      return true;
    }
    return false;
  }

 private:
  std::array<std::uint8_t, 65536> bytes_;
  alignas(cmsghdr) std::array<std::uint8_t, 512> control_;
  sockaddr_in sender_{};
  msghdr header_{};
  std::size_t size_ = 0;
};

/// As it lies in the error queue: what went wrong, and who said so.
struct QueuedError {
  sock_extended_err error;
  sockaddr_in offender;
};

void Ask(int socket, int option) {
  const int on = 1;
  ::setsockopt(socket, IPPROTO_IP, option, &on, sizeof on);
}

} // namespace

PingEchoSocket::PingEchoSocket(Descriptor socket) : EchoSocket(std::move(socket)) {
  for (const int option : {IP_RECVERR, IP_RECVTTL, IP_RECVTOS}) Ask(Number(), option);
  // Only a bound socket has its id before it sends.
  sockaddr_in any{};
  any.sin_family = AF_INET;
  socklen_t size = sizeof any;
  if (::bind(Number(), reinterpret_cast<const sockaddr*>(&any), size) != 0) return;
  ::getsockname(Number(), reinterpret_cast<sockaddr*>(&any), &size);
  id_ = ntohs(any.sin_port);
}

void PingEchoSocket::Prepare() {
  constexpr int kMostErrors = 1000;
  Message message;
  for (int count = 0; count < kMostErrors && message.Receive(Number(), MSG_ERRQUEUE); ++count) {
  }
  int error = 0;
  socklen_t size = sizeof error;
  ::getsockopt(Number(), SOL_SOCKET, SO_ERROR, &error, &size);
}

EchoSocket::Reading PingEchoSocket::Read(const SentEcho& echo, EchoReply& answer) {
  const Reading error = ReadError(echo, answer);
  return error == Reading::Nothing ? ReadReply(echo, answer) : error;
}

EchoSocket::Reading PingEchoSocket::ReadError(const SentEcho& echo, EchoReply& answer) {
  Message message;
  if (!message.Receive(Number(), MSG_ERRQUEUE)) return Reading::Nothing;
  QueuedError queued{};
  if (!message.Beside(IP_RECVERR, &queued, sizeof queued)) return Reading::Foreign;
  if (queued.error.ee_origin != SO_EE_ORIGIN_ICMP || !IsBeginOf(message.Bytes(), echo) ||
      message.Sender() != echo.target)
    return Reading::Foreign;
  const auto status = EchoStatusOf(queued.error.ee_type, queued.error.ee_code);
  if (!status) return Reading::Foreign;
  answer = {Ipv4Address::FromMemory(queued.offender.sin_addr.s_addr), *status, 0, 0, 0, {}};
  return Reading::Answer;
}

EchoSocket::Reading PingEchoSocket::ReadReply(const SentEcho& echo, EchoReply& answer) {
  Message message;
  if (!message.Receive(Number(), 0)) return errno == EAGAIN ? Reading::Nothing : Reading::Foreign;
  if (!IsReplyTo(message.Bytes(), echo)) return Reading::Foreign;
  const auto data = message.Bytes().subspan(kEchoHeaderSize);
  answer = {message.Sender(), kEchoSuccess, 0, 0, 0, {data.begin(), data.end()}};
  int ttl = 0;
  if (message.Beside(IP_TTL, &ttl, sizeof ttl)) answer.ttl = static_cast<std::uint8_t>(ttl);
  message.Beside(IP_TOS, &answer.tos, sizeof answer.tos);
  return Reading::Answer;
}

} // namespace quendra::platform::linux_
