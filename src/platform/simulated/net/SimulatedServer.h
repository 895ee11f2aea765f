#pragma once

#include "platform/simulated/net/SimulatedPeer.h"

namespace quendra::platform::simulated {

/// Who listens at an address. Accepts and stays silent unless told otherwise; Greet, Answer, Close and Reset
/// make up, in the order in which they are called, what each connection brings.
class SimulatedServer {
 public:
  /// From now on connections end with this error.
  SimulatedServer& Refuse(std::int32_t error = kConnectionRefused);
  /// From now on nobody answers those who connect.
  SimulatedServer& StaySilent();

  /// Sent without being asked.
  SimulatedServer& Greet(std::string bytes);
  /// Sent when the client has sent something (more); each piece arrives for itself.
  SimulatedServer& Answer(std::vector<std::string> pieces);
  SimulatedServer& Close();
  SimulatedServer& Reset();
  /// Each piece, close or reset waits for a Step of its own instead of the loop's next round.
  SimulatedServer& Slowly();
  /// All that comes goes back.
  SimulatedServer& Echo();
  /// Each connection takes at most this many bytes, then none until the loop's next round.
  SimulatedServer& TakeAtMost(std::size_t bytes);

  /// The connections so far, in the order in which they came.
  std::vector<std::shared_ptr<SimulatedPeer>> Connections;

  enum class Manner { Accepts, Refuses, Silent };
  struct Action {
    enum class Kind { Wait, Send, Close, Reset };
    Kind kind;
    std::string bytes{};
  };

 private:
  friend class SimulatedConnections;
  friend class ScriptedPeer;

  SimulatedServer& Add(Action action);

  Manner manner_ = Manner::Accepts;
  std::int32_t refusal_ = 0;
  std::vector<Action> script_;
  bool slow_ = false;
  bool echo_ = false;
  std::size_t room_ = SocketEnd::kNoLimit;
};

} // namespace quendra::platform::simulated
