#pragma once

#include "platform/EventLoop.h"
#include "platform/simulated/remote_access/SimulatedConnection.h"

#include <list>
#include <map>
#include <optional>
#include <vector>

namespace quendra::platform::simulated {

/// A change of a dial as its window is told.
struct DialEvent {
  WindowHandle window;
  std::uint32_t message = 0;
  std::uint32_t state = 0;
  std::uint32_t error = 0;
};

/// Connections and the dials that make them. With a loop a dial goes one step a round of it; without one it
/// goes when a test says so.
class SimulatedDials {
 public:
  void UseLoop(EventLoop& loop) { loop_ = &loop; }

  /// What the next dials of an entry go through.
  DialScript& Script(const std::string& entryName) { return scripts_[entryName] = DialScript(); }
  /// A dial by the entry's script, which connects where there is none. Gives an error that ended it at once:
  /// a dial that tells a window has none.
  std::uint32_t Start(SimulatedConnection connection, RasConnection& handle);
  /// The connection of that entry goes on by this script.
  void GoOn(const std::string& entryName, const DialScript& more);
  /// The next step of a dial; nothing when none has one ahead, and when the step tells nobody.
  std::optional<DialEvent> Step();

  SimulatedConnection& Add(SimulatedConnection connection);
  /// nullptr for a handle that is no connection.
  SimulatedConnection* Find(RasConnection handle);
  /// False for a handle that is no connection. What it had ahead isn't told any more.
  bool End(RasConnection handle);
  const std::list<SimulatedConnection>& Connections() const { return connections_; }

 private:
  std::uint32_t RunToItsEnd(SimulatedConnection& connection);
  void Schedule(RasConnection handle);
  std::optional<DialEvent> Advance(RasConnection handle);
  std::uint32_t Message();

  EventLoop* loop_ = nullptr;
  std::map<std::string, DialScript> scripts_;
  std::list<SimulatedConnection> connections_;
  std::uint32_t lastHandle_ = 0x200;
  std::shared_ptr<const int> life_ = std::make_shared<const int>(0);
};

} // namespace quendra::platform::simulated
