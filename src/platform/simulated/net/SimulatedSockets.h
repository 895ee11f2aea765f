#pragma once

#include "platform/EventLoop.h"
#include "platform/net/HostNames.h"
#include "platform/simulated/SimulatedCore.h"
#include "platform/simulated/net/ScriptedPeer.h"

#include <map>
#include <optional>

namespace quendra::platform::simulated {

class SimulatedHostNames;

/// Sockets on a small network of hosts, names and servers, which a test scripts. Their messages go through
/// the loop that the machine was given; without one there are none, and handles that are no socket are taken
/// as they come.
///
/// recv, WSAAsyncSelect, closesocket, WSAIsBlocking, WSACancelBlockingCall and WSACleanup stand in the
/// machine's Calls; Count tells how often any operation was called.
class SimulatedSockets : public Sockets {
 public:
  SimulatedSockets(Core& core, SimulatedHostNames& hostNames) : core_(core), hostNames_(hostNames) {}

  void UseLoop(EventLoop& loop) { loop_ = &loop; }

  // Hosts and servers. Addresses are dotted texts.

  SimulatedServer& Listen(const std::string& host, std::uint16_t port);
  /// Somebody connects to a listening socket of this machine; nullptr when none listens there or its backlog
  /// is full.
  std::shared_ptr<SimulatedPeer> Dial(std::uint16_t port, const std::string& from = "10.9.9.9",
                                      std::uint16_t fromPort = 4000);
  /// One action of each connection to a slow server; false when there was none to do.
  bool Step();

  /// A datagram reaches the socket that is bound to a port of this machine; false when there is none.
  bool SendDatagram(const std::string& from, std::uint16_t fromPort, std::uint16_t toPort, std::string bytes);
  /// Datagrams to that address come back.
  void EchoDatagrams(const std::string& host, std::uint16_t port) { echoes_.push_back(At(host, port)); }
  struct SentDatagram {
    std::string bytes;
    SocketAddress to;
  };
  std::vector<SentDatagram> Datagrams;

  // Names, beside those that the host names know: kHostNotFound for any other.

  void FailName(const std::string& name, std::int32_t error = kHostNotFound) { failingNames_[name] = error; }
  void NeverAnswer(const std::string& name) { silentNames_.push_back(name); }
  int LookUpsUnderWay() const { return static_cast<int>(lookUps_.size()); }

  // Faults.

  /// The next calls of an operation, by its name, fail with an error number.
  void Fail(const std::string& operation, std::int32_t error, int times = 1);
  int Count(const std::string& operation) const;

  int OpenSockets() const { return static_cast<int>(sockets_.size()); }
  std::int32_t SendBufferSize = 8192;
  std::int32_t ReceiveBufferSize = 8192;

  // For sockets that have no network: what a test puts before recv.

  /// What the next reads of a socket give; a read takes at most one of them. A socket with nothing left is at
  /// its end.
  void Receive(SocketHandle socket, std::vector<std::uint8_t> bytes) {
    waiting_[socket].push_back(std::move(bytes));
  }
  /// A read that fails, after those that wait already.
  void FailReceive(SocketHandle socket) { waiting_[socket].push_back(std::nullopt); }
  bool Blocking = false;

  // Sockets.

  std::int32_t WSAStartup(std::uint16_t version) override;
  std::int32_t WSACleanup() override;
  std::int32_t WSAGetLastError() override { return lastError_; }
  SocketHandle socket(std::int32_t family, std::int32_t type, std::int32_t protocol) override;
  std::int32_t closesocket(SocketHandle socket) override;
  std::int32_t bind(SocketHandle socket, const SocketAddress& local) override;
  std::int32_t listen(SocketHandle socket, std::int32_t backlog) override;
  SocketHandle accept(SocketHandle socket) override;
  std::int32_t connect(SocketHandle socket, const SocketAddress& peer) override;
  std::int32_t getsockname(SocketHandle socket, SocketAddress& local) override;
  std::int32_t getpeername(SocketHandle socket, SocketAddress& peer) override;
  std::int32_t getsockopt(SocketHandle socket, std::int32_t level, std::int32_t option,
                          std::int32_t& value) override;
  std::int32_t setsockopt(SocketHandle socket, std::int32_t level, std::int32_t option,
                          std::int32_t value) override;
  std::int32_t ioctlsocket(SocketHandle socket, std::uint32_t command, std::uint32_t& value) override;
  std::int32_t send(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t flags) override;
  std::int32_t sendto(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t flags,
                      const SocketAddress& peer) override;
  std::int32_t recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) override;
  std::int32_t recvfrom(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags,
                        SocketAddress& from) override;
  std::int32_t WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                              std::int32_t events) override;
  LookUpHandle WSAAsyncGetHostByName(WindowHandle window, std::uint32_t message, const std::string& name,
                                     std::span<std::uint8_t> buffer) override;
  std::int32_t WSACancelAsyncRequest(LookUpHandle lookUp) override;
  bool WSAIsBlocking() override;
  std::int32_t WSACancelBlockingCall() override;

  // Called by the far ends.

  void Arrive(SocketEnd& end, const std::string& bytes);
  void EndOf(SocketEnd& end, std::int32_t error);
  /// Runs after what waits in the loop.
  void Later(std::function<void()> work);

 private:
  using End = std::shared_ptr<SocketEnd>;
  struct LookUp {
    WindowHandle window;
    std::uint32_t message;
    std::string name;
    std::span<std::uint8_t> buffer;
  };

  static SocketAddress At(const std::string& host, std::uint16_t port) { return {AddressOf(host), port}; }
  std::int32_t Refused(std::int32_t error);
  /// True when a call of this name is scripted to fail; the last error is set then.
  bool Scripted(const std::string& operation);
  End Find(SocketHandle socket);
  SocketHandle Give(const End& end);
  std::uint16_t FreePort();
  bool IsOwn(Ipv4Address address) const;
  Ipv4Address OwnAddressTowards(Ipv4Address address) const;
  End Listener(std::uint16_t port);
  void Announce(SocketEnd& end, SocketEvent event, std::int32_t error = 0);
  void Update(SocketEnd& end);
  void Answered(const End& end);
  void Meet(const End& end, const End& listener);
  void Refill(const End& end);
  void Resolved(LookUpHandle lookUp);
  std::int32_t ScriptedRead(SocketHandle socket, std::span<std::uint8_t> buffer);

  Core& core_;
  SimulatedHostNames& hostNames_;
  EventLoop* loop_ = nullptr;
  int started_ = 0;
  std::int32_t lastError_ = 0;
  std::map<SocketHandle, End> sockets_;
  std::uint32_t lastSocket_ = 0x400;
  std::uint16_t lastPort_ = 1024;
  std::map<std::pair<Ipv4Address, std::uint16_t>, SimulatedServer> servers_;
  std::vector<std::weak_ptr<ScriptedPeer>> scripted_;
  std::vector<SocketAddress> echoes_;
  std::map<std::string, std::int32_t> failingNames_;
  std::vector<std::string> silentNames_;
  std::map<LookUpHandle, LookUp> lookUps_;
  std::uint32_t lastLookUp_ = 0x9000;
  std::map<std::string, std::deque<std::int32_t>> failures_;
  std::map<std::string, int> counts_;
  std::map<SocketHandle, std::deque<std::optional<std::vector<std::uint8_t>>>> waiting_;
  /// Work that waits in the loop does nothing once this has gone.
  std::shared_ptr<const int> life_ = std::make_shared<const int>(0);
};

} // namespace quendra::platform::simulated
