#include "platform/linux/icmp/LinuxIcmp.h"

#include <poll.h>

#include <cerrno>
#include <chrono>

namespace quendra::platform::linux_ {

namespace {

using SteadyClock = std::chrono::steady_clock;

/// What an ICMP message can carry behind its header.
constexpr std::size_t kMostData = 65507;

std::uint32_t StatusOfSendError(int error) {
  switch (error) {
  case ENETUNREACH: return kEchoNetUnreachable;
  case EHOSTUNREACH: return kEchoHostUnreachable;
  case EMSGSIZE: return kEchoPacketTooBig;
  case ENOMEM:
  case ENOBUFS: return kEchoNoResources;
  case EACCES: return kEchoBadDestination; // a broadcast address
  default: return kEchoGeneralFailure;
  }
}

std::uint32_t MillisecondsSince(SteadyClock::time_point start) {
  const auto passed = std::chrono::duration_cast<std::chrono::milliseconds>(SteadyClock::now() - start);
  return static_cast<std::uint32_t>(passed.count());
}

/// Until something comes, a signal or the deadline.
void WaitFor(int socket, SteadyClock::time_point deadline) {
  const auto left = std::chrono::duration_cast<std::chrono::nanoseconds>(deadline - SteadyClock::now());
  if (left.count() <= 0) return;
  const timespec limit{static_cast<time_t>(left.count() / 1'000'000'000),
                       static_cast<long>(left.count() % 1'000'000'000)};
  pollfd watched{socket, POLLIN, 0};
  ::ppoll(&watched, 1, &limit, nullptr);
}

/// The deadline holds also while others keep sending what isn't ours.
bool Await(EchoSocket& socket, const SentEcho& echo, SteadyClock::time_point deadline, EchoReply& answer) {
  while (SteadyClock::now() < deadline) {
    switch (socket.Read(echo, answer)) {
    case EchoSocket::Reading::Answer: return true;
    case EchoSocket::Reading::Nothing: WaitFor(socket.Number(), deadline); break;
    case EchoSocket::Reading::Foreign: break;
    }
  }
  return false;
}

std::uint32_t NoReply(std::span<std::uint8_t> buffer, std::uint32_t status) {
  PutEchoFailure(buffer, status);
  return 0;
}

} // namespace

IcmpHandle LinuxIcmp::IcmpCreateFile() {
  OpenedEchoSocket opened = openSocket_();
  lacksRight_ = opened.lacksRight;
  if (!opened.socket) return kNoIcmp;
  lastHandle_ += 4;
  open_[IcmpHandle(lastHandle_)].socket = std::move(opened.socket);
  return IcmpHandle(lastHandle_);
}

std::uint32_t LinuxIcmp::IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                                      std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) {
  const auto found = open_.find(handle);
  if (found == open_.end() || request.data.size() > kMostData) return NoReply(replyBuffer, kEchoBadRequest);
  if (replyBuffer.size() < kEchoReplySize) return 0;
  EchoSocket& socket = *found->second.socket;
  const SentEcho echo{request.address, socket.Id(), ++found->second.lastSequence, request.data};
  const auto start = SteadyClock::now();
  if (const int error = socket.Send(echo, request.options); error != 0)
    return NoReply(replyBuffer, StatusOfSendError(error));
  EchoReply answer;
  if (!Await(socket, echo, start + std::chrono::milliseconds(milliseconds), answer))
    return NoReply(replyBuffer, kEchoTimedOut);
  answer.roundTripTime = MillisecondsSince(start);
  PutEchoReply(replyBuffer, answer);
  return 1;
}

} // namespace quendra::platform::linux_
