#include "platform/simulated/remote_access/SimulatedDials.h"

#include <algorithm>

namespace quendra::platform::simulated {

namespace {

bool TellsWindow(const Dialling::Notifier& notifier) {
  return notifier.type == kRasNotifierIsWindow && notifier.window != kNoWindow;
}

} // namespace

SimulatedConnection& SimulatedDials::Add(SimulatedConnection connection) {
  connection.handle = RasConnection(++lastHandle_);
  return connections_.emplace_back(std::move(connection));
}

SimulatedConnection* SimulatedDials::Find(RasConnection handle) {
  const auto found = std::ranges::find(connections_, handle, &SimulatedConnection::handle);
  return found == connections_.end() ? nullptr : &*found;
}

bool SimulatedDials::End(RasConnection handle) {
  return std::erase_if(connections_, [&](const auto& connection) { return connection.handle == handle; }) > 0;
}

std::uint32_t SimulatedDials::Start(SimulatedConnection connection, RasConnection& handle) {
  const auto script = scripts_.find(connection.entryName);
  connection.ahead = script == scripts_.end() ? DialScript().ThenConnected() : script->second;
  SimulatedConnection& dialled = Add(std::move(connection));
  handle = dialled.handle;
  if (TellsWindow(dialled.notifier)) {
    Schedule(handle);
    return kRasSuccess;
  }
  const std::uint32_t error = RunToItsEnd(dialled);
  if (error == kRasSuccess) return error;
  End(handle);
  handle = kNoRasConnection;
  return error;
}

// Another program may end the connection meanwhile. A script without an end would wait for ever.
std::uint32_t SimulatedDials::RunToItsEnd(SimulatedConnection& connection) {
  const RasConnection handle = connection.handle;
  while (SimulatedConnection* dialled = Find(handle)) {
    if (dialled->state == kRasConnected) return kRasSuccess;
    if (dialled->ahead.IsEmpty()) return kRasNoAnswer;
    const DialScript::Step step = dialled->ahead.TakeFirst();
    dialled->state = step.state;
    if (step.meanwhile) step.meanwhile();
    if (step.error != 0) return step.error;
  }
  return kRasUserDisconnection;
}

void SimulatedDials::GoOn(const std::string& entryName, const DialScript& more) {
  for (SimulatedConnection& connection : connections_) {
    if (connection.entryName != entryName) continue;
    const bool rests = connection.ahead.IsEmpty();
    connection.ahead.Append(more);
    if (rests) Schedule(connection.handle);
  }
}

void SimulatedDials::Schedule(RasConnection handle) {
  if (!loop_) return;
  loop_->Post([this, life = std::weak_ptr(life_), handle] {
    if (life.expired()) return;
    if (const auto event = Advance(handle))
      loop_->PostMessage(event->window, event->message, event->state, event->error);
    const SimulatedConnection* connection = Find(handle);
    // Behind the message: what it brings about comes before the next step.
    if (connection && !connection->ahead.IsEmpty()) Schedule(handle);
  });
}

std::optional<DialEvent> SimulatedDials::Step() {
  const auto busy =
      std::ranges::find_if(connections_, [](const auto& connection) { return !connection.ahead.IsEmpty(); });
  return busy == connections_.end() ? std::nullopt : Advance(busy->handle);
}

std::optional<DialEvent> SimulatedDials::Advance(RasConnection handle) {
  SimulatedConnection* connection = Find(handle);
  if (!connection || connection->ahead.IsEmpty()) return {};
  const DialScript::Step step = connection->ahead.TakeFirst();
  connection->state = step.state;
  if (step.meanwhile) {
    step.meanwhile();
    return {};
  }
  if (!TellsWindow(connection->notifier)) return {};
  return DialEvent{connection->notifier.window, Message(), step.state, step.error};
}

std::uint32_t SimulatedDials::Message() {
  const std::uint32_t registered = loop_ ? loop_->RegisterWindowMessageA(kRasDialEventName) : 0;
  return registered != 0 ? registered : kRasDialEvent;
}

} // namespace quendra::platform::simulated
