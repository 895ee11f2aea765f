#include "platform/simulated/net/SimulatedSockets.h"

namespace quendra::platform::simulated {

std::int32_t SimulatedSockets::send(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t) {
  if (Scripted("send")) {
    // After a send that would block comes the event that the socket can send again.
    const End refused = table_.Find(socket);
    if (refused && WSAGetLastError() == kWouldBlock) {
      refused->room = 0;
      streams_.Refill(refused);
    }
    return kSocketError;
  }
  const End end = Find(socket);
  return end ? streams_.Send(end, bytes) : kSocketError;
}

std::int32_t SimulatedSockets::sendto(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t,
                                      const SocketAddress& peer) {
  if (Scripted("sendto")) return kSocketError;
  const End end = Find(socket);
  return end ? datagrams_.Send(*end, bytes, peer) : kSocketError;
}

std::int32_t SimulatedSockets::recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) {
  core_.calls.push_back("recv " + std::to_string(socket.Value()) + " " + std::to_string(buffer.size()));
  if (scriptedReads_.Knows(socket) || (!messages_.HasLoop() && !table_.Has(socket)))
    return scriptedReads_.Read(socket, buffer);
  if (Scripted("recv")) return kSocketError;
  SocketAddress from;
  return recvfrom(socket, buffer, flags, from);
}

std::int32_t SimulatedSockets::recvfrom(SocketHandle socket, std::span<std::uint8_t> buffer,
                                        std::int32_t flags, SocketAddress& from) {
  if (Scripted("recvfrom")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  end->selection.enabled |= kFdRead;
  const bool peeks = (flags & kPeek) != 0;
  return end->stage == SocketEnd::Stage::Datagram ? datagrams_.Receive(*end, buffer, peeks, from)
                                                  : streams_.Receive(*end, buffer, peeks);
}

} // namespace quendra::platform::simulated
