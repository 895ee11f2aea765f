#pragma once

#include "platform/simulated/net/SimulatedHostNames.h"
#include "platform/simulated/net/SocketEnd.h"

#include <map>

namespace quendra::platform::simulated {

/// The open sockets of this machine, by their handles and by their ports.
class SocketTable {
 public:
  using End = std::shared_ptr<SocketEnd>;

  explicit SocketTable(const SimulatedHostNames& hostNames) : hostNames_(hostNames) {}

  /// Gives the socket the next handle.
  SocketHandle Add(const End& end);
  void Remove(SocketHandle socket) { sockets_.erase(socket); }
  void Clear() { sockets_.clear(); }
  /// nullptr for a handle that is no open socket.
  End Find(SocketHandle socket) const;
  bool Has(SocketHandle socket) const { return sockets_.contains(socket); }
  int Count() const { return static_cast<int>(sockets_.size()); }

  /// nullptr when nobody listens at the port.
  End ListenerAt(std::uint16_t port) const;
  std::vector<End> DatagramSocketsAt(std::uint16_t port) const;
  /// Binds to a port of its own what is not bound yet.
  void EnsurePort(SocketEnd& end);
  /// 0, or the number of the reason why the socket can't have this address.
  std::int32_t Bind(SocketEnd& end, const SocketAddress& local);

 private:
  std::uint16_t FreePort();

  const SimulatedHostNames& hostNames_;
  std::map<SocketHandle, End> sockets_;
  std::uint32_t lastSocket_ = 0x400;
  std::uint16_t lastPort_ = 1024;
};

} // namespace quendra::platform::simulated
