#include "platform/simulated/net/ScriptedPeer.h"

#include "platform/simulated/net/SimulatedStreams.h"

namespace quendra::platform::simulated {

ScriptedPeer::ScriptedPeer(SimulatedStreams& streams, std::weak_ptr<SocketEnd> near,
                           const SimulatedServer& server)
    : SimulatedPeer(streams, std::move(near)), server_(server) {}

void ScriptedPeer::Begin() {
  if (server_.room_ != SocketEnd::kNoLimit) TakeAtMost(server_.room_);
  Schedule();
}

void ScriptedPeer::OnReceived() {
  if (server_.echo_) Send(Received.substr(seen_));
  if (server_.echo_) seen_ = Received.size();
  Schedule();
}

bool ScriptedPeer::CanAct() const {
  if (next_ == server_.script_.size()) return false;
  return server_.script_[next_].kind != SimulatedServer::Action::Kind::Wait || Received.size() > seen_;
}

void ScriptedPeer::Schedule() {
  if (server_.slow_ || scheduled_ || !CanAct()) return;
  scheduled_ = true;
  Streams().Later([self = weak_from_this()] {
    const auto peer = std::static_pointer_cast<ScriptedPeer>(self.lock());
    if (!peer) return;
    peer->scheduled_ = false;
    peer->Act();
    peer->Schedule();
  });
}

bool ScriptedPeer::Step() {
  if (!CanAct()) return false;
  Act();
  return true;
}

void ScriptedPeer::Act() {
  using Kind = SimulatedServer::Action::Kind;
  if (!CanAct()) return;
  if (server_.script_[next_].kind == Kind::Wait) {
    seen_ = Received.size();
    ++next_;
  }
  if (next_ == server_.script_.size()) return;
  const auto& action = server_.script_[next_];
  if (action.kind == Kind::Wait) return;
  ++next_;
  if (action.kind == Kind::Send) Send(action.bytes);
  if (action.kind == Kind::Close) Close();
  if (action.kind == Kind::Reset) Reset();
}

} // namespace quendra::platform::simulated
