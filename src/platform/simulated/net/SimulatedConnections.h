#pragma once

#include "platform/simulated/net/ScriptedPeer.h"
#include "platform/simulated/net/SimulatedStreams.h"

namespace quendra::platform::simulated {

/// How connections come about: the servers of the network, who answers a connect, who waits for an accept.
class SimulatedConnections {
 public:
  using End = SocketTable::End;

  SimulatedConnections(SocketTable& table, const SimulatedHostNames& hostNames, SocketMessages& messages,
                       SocketFailures& failures, SimulatedStreams& streams)
      : table_(table), hostNames_(hostNames), messages_(messages), failures_(failures), streams_(streams) {}

  // The script, as SimulatedSockets tells it.

  SimulatedServer& ServerAt(const SocketAddress& address) {
    return servers_[{address.address, address.port}];
  }
  std::shared_ptr<SimulatedPeer> Dial(std::uint16_t port, const SocketAddress& from);
  bool Step();

  // What the program does.

  std::int32_t Listen(SocketEnd& end, std::int32_t backlog);
  std::int32_t Connect(const End& end, const SocketAddress& peer);
  /// The connection that has waited longest, with its listener's selection; nullptr when none waits.
  End Accept(SocketEnd& listener);

 private:
  static bool HasRoom(const SocketEnd& listener) { return listener.backlog.size() < listener.backlogSize; }
  void Answered(const End& end);
  void AnsweredByServer(const End& end);
  void Refuse(SocketEnd& end, std::int32_t error);
  void Meet(const End& end, const End& listener);

  SocketTable& table_;
  const SimulatedHostNames& hostNames_;
  SocketMessages& messages_;
  SocketFailures& failures_;
  SimulatedStreams& streams_;
  std::map<std::pair<Ipv4Address, std::uint16_t>, SimulatedServer> servers_;
  std::vector<std::weak_ptr<ScriptedPeer>> scripted_;
};

} // namespace quendra::platform::simulated
