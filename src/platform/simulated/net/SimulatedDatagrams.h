#pragma once

#include "platform/simulated/net/SocketFailures.h"
#include "platform/simulated/net/SocketMessages.h"
#include "platform/simulated/net/SocketTable.h"

namespace quendra::platform::simulated {

struct SentDatagram {
  std::string bytes;
  SocketAddress to;
};

/// Datagrams between the sockets of this machine and the network.
class SimulatedDatagrams {
 public:
  SimulatedDatagrams(SocketTable& table, const SimulatedHostNames& hostNames, SocketMessages& messages,
                     SocketFailures& failures)
      : table_(table), hostNames_(hostNames), messages_(messages), failures_(failures) {}

  /// One arrives from the network; false when no socket is bound to the port.
  bool Deliver(const SocketAddress& from, std::uint16_t toPort, std::string bytes);
  void EchoAt(const SocketAddress& address) { echoes_.push_back(address); }
  std::vector<SentDatagram> Sent;

  std::int32_t Send(SocketEnd& end, std::span<const std::uint8_t> bytes, const SocketAddress& peer);
  /// How many bytes were read, as recvfrom gives it.
  std::int32_t Receive(SocketEnd& end, std::span<std::uint8_t> buffer, bool peeks, SocketAddress& from);

 private:
  void Put(SocketEnd& end, std::string bytes, const SocketAddress& from);

  SocketTable& table_;
  const SimulatedHostNames& hostNames_;
  SocketMessages& messages_;
  SocketFailures& failures_;
  std::vector<SocketAddress> echoes_;
};

} // namespace quendra::platform::simulated
