#include "platform/simulated/net/SimulatedServer.h"

#include "platform/simulated/net/SimulatedSockets.h"

namespace quendra::platform::simulated {

void SimulatedPeer::Send(const std::string& bytes) {
  if (const auto near = near_.lock()) sockets_.Arrive(*near, bytes);
}

void SimulatedPeer::Close() {
  if (const auto near = near_.lock()) sockets_.EndOf(*near, 0);
}

void SimulatedPeer::Reset() {
  if (const auto near = near_.lock()) sockets_.EndOf(*near, kConnectionReset);
}

void SimulatedPeer::TakeAtMost(std::size_t bytes) {
  if (const auto near = near_.lock()) near->room = near->fullRoom = bytes;
}

SimulatedServer& SimulatedServer::Refuse(std::int32_t error) {
  manner_ = Manner::Refuses;
  refusal_ = error;
  return *this;
}

SimulatedServer& SimulatedServer::StaySilent() {
  manner_ = Manner::Silent;
  return *this;
}

SimulatedServer& SimulatedServer::Add(Action action) {
  script_.push_back(std::move(action));
  return *this;
}

SimulatedServer& SimulatedServer::Greet(std::string bytes) {
  return Add({Action::Kind::Send, std::move(bytes)});
}

SimulatedServer& SimulatedServer::Answer(std::vector<std::string> pieces) {
  Add({Action::Kind::Wait});
  for (auto& piece : pieces) Add({Action::Kind::Send, std::move(piece)});
  return *this;
}

SimulatedServer& SimulatedServer::Close() { return Add({Action::Kind::Close}); }
SimulatedServer& SimulatedServer::Reset() { return Add({Action::Kind::Reset}); }

SimulatedServer& SimulatedServer::Slowly() {
  slow_ = true;
  return *this;
}

SimulatedServer& SimulatedServer::Echo() {
  echo_ = true;
  return *this;
}

SimulatedServer& SimulatedServer::TakeAtMost(std::size_t bytes) {
  room_ = bytes;
  return *this;
}

ScriptedPeer::ScriptedPeer(SimulatedSockets& sockets, std::weak_ptr<SocketEnd> near,
                           const SimulatedServer& server)
    : SimulatedPeer(sockets, std::move(near)), server_(server) {}

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
  Network().Later([self = weak_from_this()] {
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
