#include "platform/simulated/net/SocketTable.h"

#include <algorithm>

namespace quendra::platform::simulated {

SocketHandle SocketTable::Add(const End& end) {
  lastSocket_ += 4;
  end->handle = SocketHandle(lastSocket_);
  sockets_[end->handle] = end;
  return end->handle;
}

SocketTable::End SocketTable::Find(SocketHandle socket) const {
  const auto found = sockets_.find(socket);
  return found == sockets_.end() ? nullptr : found->second;
}

SocketTable::End SocketTable::ListenerAt(std::uint16_t port) const {
  for (const auto& [handle, end] : sockets_)
    if (end->stage == SocketEnd::Stage::Listening && end->local.port == port) return end;
  return nullptr;
}

std::vector<SocketTable::End> SocketTable::DatagramSocketsAt(std::uint16_t port) const {
  std::vector<End> found;
  for (const auto& [handle, end] : sockets_)
    if (end->stage == SocketEnd::Stage::Datagram && end->local.port == port) found.push_back(end);
  return found;
}

void SocketTable::EnsurePort(SocketEnd& end) {
  if (end.local.port == 0) end.local.port = FreePort();
}

std::int32_t SocketTable::Bind(SocketEnd& end, const SocketAddress& local) {
  if (end.local.port != 0) return kInvalidArgument;
  if (!hostNames_.IsOwn(local.address)) return kAddressNotAvailable;
  const auto isDatagram = [](const SocketEnd& any) { return any.stage == SocketEnd::Stage::Datagram; };
  const bool isTaken = std::any_of(sockets_.begin(), sockets_.end(), [&](const auto& entry) {
    return entry.second->local.port == local.port && isDatagram(*entry.second) == isDatagram(end);
  });
  if (local.port != 0 && isTaken) return kAddressInUse;
  end.local = {local.address, local.port != 0 ? local.port : FreePort()};
  return 0;
}

std::uint16_t SocketTable::FreePort() {
  const auto isTaken = [&](std::uint16_t port) {
    return std::any_of(sockets_.begin(), sockets_.end(),
                       [&](const auto& entry) { return entry.second->local.port == port; });
  };
  do lastPort_ = lastPort_ < 1025 || lastPort_ >= 5000 ? 1025 : static_cast<std::uint16_t>(lastPort_ + 1);
  while (isTaken(lastPort_));
  return lastPort_;
}

} // namespace quendra::platform::simulated
