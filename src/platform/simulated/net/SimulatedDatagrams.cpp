#include "platform/simulated/net/SimulatedDatagrams.h"

#include "platform/simulated/SimulatedCore.h"

#include <algorithm>

namespace quendra::platform::simulated {

bool SimulatedDatagrams::Deliver(const SocketAddress& from, std::uint16_t toPort, std::string bytes) {
  const auto sockets = table_.DatagramSocketsAt(toPort);
  if (sockets.empty()) return false;
  Put(*sockets.front(), std::move(bytes), from);
  return true;
}

std::int32_t SimulatedDatagrams::Send(SocketEnd& end, std::span<const std::uint8_t> bytes,
                                      const SocketAddress& peer) {
  if (bytes.size() > std::size_t{kLargestDatagram}) return failures_.Refuse(kMessageTooLong);
  table_.EnsurePort(end);
  const std::string text = TextOf(bytes);
  Sent.push_back({text, peer});
  if (std::find(echoes_.begin(), echoes_.end(), peer) != echoes_.end()) Put(end, text, peer);
  if (hostNames_.IsOwn(peer.address))
    for (const auto& other : table_.DatagramSocketsAt(peer.port))
      Put(*other, text, {hostNames_.OwnAddressTowards(peer.address), end.local.port});
  return static_cast<std::int32_t>(bytes.size());
}

std::int32_t SimulatedDatagrams::Receive(SocketEnd& end, std::span<std::uint8_t> buffer, bool peeks,
                                         SocketAddress& from) {
  if (end.datagrams.empty()) return failures_.Refuse(kWouldBlock);
  const SocketEnd::Datagram datagram = end.datagrams.front();
  if (!peeks) end.datagrams.pop_front();
  from = datagram.from;
  std::copy_n(datagram.bytes.begin(), std::min(datagram.bytes.size(), buffer.size()), buffer.begin());
  messages_.Update(end);
  if (datagram.bytes.size() > buffer.size()) return failures_.Refuse(kMessageTooLong);
  return static_cast<std::int32_t>(datagram.bytes.size());
}

void SimulatedDatagrams::Put(SocketEnd& end, std::string bytes, const SocketAddress& from) {
  end.datagrams.push_back({std::move(bytes), from});
  messages_.Update(end);
}

} // namespace quendra::platform::simulated
