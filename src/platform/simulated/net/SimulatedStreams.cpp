#include "platform/simulated/net/SimulatedStreams.h"

#include "platform/simulated/SimulatedCore.h"
#include "platform/simulated/net/SimulatedPeer.h"

#include <algorithm>

namespace quendra::platform::simulated {

std::int32_t SimulatedStreams::Send(const End& end, std::span<const std::uint8_t> bytes) {
  if (end->stage != SocketEnd::Stage::Connected) return failures_.Refuse(kNotConnected);
  if (end->ended && end->endError != 0) return failures_.Refuse(end->endError);
  if (end->room == 0) {
    Refill(end);
    return failures_.Refuse(kWouldBlock);
  }
  const std::size_t taken = std::min(bytes.size(), end->room);
  if (end->room != SocketEnd::kNoLimit) end->room -= taken;
  const std::string text = TextOf(bytes.first(taken));
  if (const End partner = end->partner.lock()) Arrive(*partner, text);
  if (const auto peer = end->peer) {
    peer->Received += text;
    peer->OnReceived();
  }
  return static_cast<std::int32_t>(taken);
}

void SimulatedStreams::Refill(const End& end) {
  end->selection.enabled |= kFdWrite;
  messages_.Later([this, end] {
    end->room = end->fullRoom;
    if (table_.Has(end->handle)) messages_.Update(*end);
  });
}

std::int32_t SimulatedStreams::Receive(SocketEnd& end, std::span<std::uint8_t> buffer, bool peeks) {
  if (end.arrived.empty() && !end.ended) return failures_.Refuse(kWouldBlock);
  if (end.arrived.empty() && end.endError != 0) return failures_.Refuse(end.endError);
  const std::size_t count = std::min(end.arrived.size(), buffer.size());
  std::copy_n(end.arrived.begin(), count, buffer.begin());
  if (!peeks) end.arrived.erase(0, count);
  messages_.Update(end);
  return static_cast<std::int32_t>(count);
}

void SimulatedStreams::Close(const SocketEnd& end) {
  if (end.peer) end.peer->Ended = true;
  if (const End partner = end.partner.lock()) EndOf(*partner, end.arrived.empty() ? 0 : kConnectionReset);
  for (const End& waiting : end.backlog) {
    if (waiting->peer) waiting->peer->Ended = true;
    if (const End partner = waiting->partner.lock()) EndOf(*partner, kConnectionReset);
  }
}

void SimulatedStreams::Arrive(SocketEnd& end, const std::string& bytes) {
  if (end.ended) return;
  end.arrived += bytes;
  messages_.Update(end);
}

void SimulatedStreams::EndOf(SocketEnd& end, std::int32_t error) {
  if (end.ended) return;
  end.ended = true;
  end.endError = error;
  messages_.Update(end);
}

} // namespace quendra::platform::simulated
