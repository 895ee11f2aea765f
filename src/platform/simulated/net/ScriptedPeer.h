#pragma once

#include "platform/simulated/net/SimulatedServer.h"

namespace quendra::platform::simulated {

/// A connection to a server: plays the server's script.
class ScriptedPeer : public SimulatedPeer {
 public:
  ScriptedPeer(SimulatedStreams& streams, std::weak_ptr<SocketEnd> near, const SimulatedServer& server);

  /// The connection stands.
  void Begin();
  /// One action of a slow server; false when there is none to do now.
  bool Step();
  void OnReceived() override;

 private:
  bool CanAct() const;
  void Schedule();
  void Act();

  const SimulatedServer& server_;
  std::size_t next_ = 0;
  std::size_t seen_ = 0;
  bool scheduled_ = false;
};

} // namespace quendra::platform::simulated
