#include "platform/simulated/icmp/SimulatedIcmp.h"

#include "platform/icmp/EchoReply.h"

namespace quendra::platform::simulated {

IcmpHandle SimulatedIcmp::IcmpCreateFile() {
  if (FailHandle || !LackedRight.empty()) return kNoIcmp;
  lastHandle_ += 4;
  return *open_.insert(IcmpHandle(lastHandle_)).first;
}

std::uint32_t SimulatedIcmp::IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                                          std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) {
  if (!open_.contains(handle)) PutEchoFailure(replyBuffer, kEchoBadRequest);
  if (!open_.contains(handle) || replyBuffer.size() < kEchoReplySize) return 0;
  const std::uint8_t ttl = request.options.empty() ? kOwnTtl : request.options[kOptionsTtl];
  Echoes.push_back({request.address,
                    ttl,
                    TextOf(request.data),
                    {request.options.begin(), request.options.end()},
                    replyBuffer.size(),
                    milliseconds});
  const auto route = routes_.find(request.address);
  const auto answer = route == routes_.end() ? std::nullopt : route->second.Send(request.address, ttl);
  const bool isInTime = answer && answer->delay < milliseconds;
  core_.tickCount += isInTime ? answer->delay : milliseconds;
  if (!isInTime) {
    PutEchoFailure(replyBuffer, kEchoTimedOut);
    return 0;
  }
  EchoReply reply{answer->address, answer->status, answer->delay, kOwnTtl, 0, {}};
  if (answer->status == kEchoSuccess) reply.data.assign(request.data.begin(), request.data.end());
  PutEchoReply(replyBuffer, reply);
  return 1;
}

} // namespace quendra::platform::simulated
