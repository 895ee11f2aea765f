#include "platform/simulated/net/SimulatedConnections.h"

#include <algorithm>

namespace quendra::platform::simulated {

std::shared_ptr<SimulatedPeer> SimulatedConnections::Dial(std::uint16_t port, const SocketAddress& from) {
  const End listener = table_.ListenerAt(port);
  if (!listener || !HasRoom(*listener)) return nullptr;
  const auto end = std::make_shared<SocketEnd>();
  end->stage = SocketEnd::Stage::Connected;
  end->remote = from;
  end->local = {hostNames_.OwnAddressTowards(from.address), port};
  end->peer = std::make_shared<SimulatedPeer>(streams_, end);
  listener->backlog.push_back(end);
  messages_.Update(*listener);
  return end->peer;
}

bool SimulatedConnections::Step() {
  bool any = false;
  for (const auto& scripted : scripted_)
    if (const auto peer = scripted.lock()) any |= peer->Step();
  return any;
}

std::int32_t SimulatedConnections::Listen(SocketEnd& end, std::int32_t backlog) {
  if (end.stage == SocketEnd::Stage::Datagram) return failures_.Refuse(kOperationNotSupported);
  end.stage = SocketEnd::Stage::Listening;
  end.backlogSize = static_cast<std::size_t>(std::max(backlog, 1));
  messages_.Update(end);
  return 0;
}

std::int32_t SimulatedConnections::Connect(const End& end, const SocketAddress& peer) {
  if (end->stage == SocketEnd::Stage::Connecting) return failures_.Refuse(kAlreadyInProgress);
  if (end->stage == SocketEnd::Stage::Connected) return failures_.Refuse(kAlreadyConnected);
  if (peer.address.IsAny() || peer.port == 0) return failures_.Refuse(kAddressNotAvailable);
  end->stage = SocketEnd::Stage::Connecting;
  end->remote = peer;
  table_.EnsurePort(*end);
  if (end->local.address.IsAny()) end->local.address = hostNames_.OwnAddressTowards(peer.address);
  messages_.Later([this, end] { Answered(end); });
  return failures_.Refuse(kWouldBlock);
}

SimulatedConnections::End SimulatedConnections::Accept(SocketEnd& listener) {
  if (listener.backlog.empty()) return nullptr;
  End end = listener.backlog.front();
  listener.backlog.pop_front();
  end->selection.Select(listener.selection.window, listener.selection.message, listener.selection.mask);
  return end;
}

void SimulatedConnections::Answered(const End& end) {
  if (!table_.Has(end->handle) || end->stage != SocketEnd::Stage::Connecting) return;
  const bool isOwn = hostNames_.IsOwn(end->remote.address);
  const End listener = isOwn ? table_.ListenerAt(end->remote.port) : nullptr;
  if (listener) return HasRoom(*listener) ? Meet(end, listener) : Refuse(*end, kConnectionRefused);
  if (servers_.contains({end->remote.address, end->remote.port})) return AnsweredByServer(end);
  Refuse(*end, isOwn ? kConnectionRefused : kConnectionTimedOut);
}

void SimulatedConnections::AnsweredByServer(const End& end) {
  SimulatedServer& server = ServerAt(end->remote);
  if (server.manner_ == SimulatedServer::Manner::Silent) return;
  if (server.manner_ == SimulatedServer::Manner::Refuses) return Refuse(*end, server.refusal_);
  const auto peer = std::make_shared<ScriptedPeer>(streams_, end, server);
  end->peer = peer;
  end->stage = SocketEnd::Stage::Connected;
  server.Connections.push_back(peer);
  scripted_.push_back(peer);
  messages_.Announce(*end, kFdConnect);
  messages_.Update(*end);
  peer->Begin();
}

void SimulatedConnections::Refuse(SocketEnd& end, std::int32_t error) {
  end.stage = SocketEnd::Stage::Fresh;
  messages_.Announce(end, kFdConnect, error);
}

void SimulatedConnections::Meet(const End& end, const End& listener) {
  const auto other = std::make_shared<SocketEnd>();
  other->stage = end->stage = SocketEnd::Stage::Connected;
  other->local = end->remote;
  other->remote = end->local;
  other->partner = end;
  end->partner = other;
  listener->backlog.push_back(other);
  messages_.Announce(*end, kFdConnect);
  messages_.Update(*end);
  messages_.Update(*listener);
}

} // namespace quendra::platform::simulated
