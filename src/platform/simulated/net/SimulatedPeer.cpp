#include "platform/simulated/net/SimulatedPeer.h"

#include "platform/simulated/net/SimulatedStreams.h"

namespace quendra::platform::simulated {

void SimulatedPeer::Send(const std::string& bytes) {
  if (const auto near = near_.lock()) streams_.Arrive(*near, bytes);
}

void SimulatedPeer::Close() {
  if (const auto near = near_.lock()) streams_.EndOf(*near, 0);
}

void SimulatedPeer::Reset() {
  if (const auto near = near_.lock()) streams_.EndOf(*near, kConnectionReset);
}

void SimulatedPeer::TakeAtMost(std::size_t bytes) {
  if (const auto near = near_.lock()) near->room = near->fullRoom = bytes;
}

} // namespace quendra::platform::simulated
