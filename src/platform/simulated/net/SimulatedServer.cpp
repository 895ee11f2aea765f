#include "platform/simulated/net/SimulatedServer.h"

namespace quendra::platform::simulated {

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

} // namespace quendra::platform::simulated
