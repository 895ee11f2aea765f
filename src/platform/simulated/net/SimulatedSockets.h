#pragma once

#include "platform/simulated/SimulatedCore.h"
#include "platform/simulated/net/SimulatedConnections.h"
#include "platform/simulated/net/SimulatedDatagrams.h"
#include "platform/simulated/net/SimulatedLookUps.h"
#include "platform/simulated/net/dormant/ScriptedReads.h"

namespace quendra::platform::simulated {

/// Sockets on a small network of hosts, names and servers, which a test scripts. Their messages go through
/// the loop that the machine was given; without one there are none, and handles that are no socket are taken
/// as they come.
///
/// recv, WSAAsyncSelect, closesocket, WSAIsBlocking, WSACancelBlockingCall and WSACleanup stand in the
/// machine's Calls; Count tells how often any operation was called.
class SimulatedSockets : public Sockets {
 public:
  SimulatedSockets(Core& core, SimulatedHostNames& hostNames)
      : core_(core), table_(hostNames), streams_(table_, messages_, failures_),
        connections_(table_, hostNames, messages_, failures_, streams_),
        datagrams_(table_, hostNames, messages_, failures_), lookUps_(hostNames, messages_) {}

  void UseLoop(EventLoop& loop) { messages_.UseLoop(loop); }

  // Hosts and servers. Addresses are dotted texts.

  SimulatedServer& Listen(const std::string& host, std::uint16_t port) {
    return connections_.ServerAt(At(host, port));
  }
  /// Somebody connects to a listening socket of this machine; nullptr when none listens there or its backlog
  /// is full.
  std::shared_ptr<SimulatedPeer> Dial(std::uint16_t port, const std::string& from = "10.9.9.9",
                                      std::uint16_t fromPort = 4000) {
    return connections_.Dial(port, At(from, fromPort));
  }
  /// One action of each connection to a slow server; false when there was none to do.
  bool Step() { return connections_.Step(); }

  /// A datagram reaches the socket that is bound to a port of this machine; false when there is none.
  bool SendDatagram(const std::string& from, std::uint16_t fromPort, std::uint16_t toPort,
                    std::string bytes) {
    return datagrams_.Deliver(At(from, fromPort), toPort, std::move(bytes));
  }
  /// Datagrams to that address come back.
  void EchoDatagrams(const std::string& host, std::uint16_t port) { datagrams_.EchoAt(At(host, port)); }
  const std::vector<SentDatagram>& Datagrams() const { return datagrams_.Sent; }

  // Names, beside those that the host names know: kHostNotFound for any other.

  void FailName(const std::string& name, std::int32_t error = kHostNotFound) {
    lookUps_.FailName(name, error);
  }
  void NeverAnswer(const std::string& name) { lookUps_.NeverAnswer(name); }
  int LookUpsUnderWay() const { return lookUps_.CountUnderWay(); }

  // Faults.

  /// The next calls of an operation, by its name, fail with an error number.
  void Fail(const std::string& operation, std::int32_t error, int times = 1) {
    failures_.Script(operation, error, times);
  }
  int Count(const std::string& operation) const { return failures_.Calls(operation); }

  int OpenSockets() const { return table_.Count(); }
  std::int32_t SendBufferSize = 8192;
  std::int32_t ReceiveBufferSize = 8192;

  // Dormant, as ScriptedReads says.

  /// What the next reads of a socket give; a read takes at most one of them. A socket with nothing left is at
  /// its end.
  void Receive(SocketHandle socket, std::vector<std::uint8_t> bytes) {
    scriptedReads_.Put(socket, std::move(bytes));
  }
  /// A read that fails, after those that wait already.
  void FailReceive(SocketHandle socket) { scriptedReads_.PutFailure(socket); }
  bool Blocking = false;

  // Sockets.

  std::int32_t WSAStartup(std::uint16_t version) override;
  std::int32_t WSACleanup() override;
  std::int32_t WSAGetLastError() override { return failures_.LastError(); }
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

 private:
  using End = SocketTable::End;

  static SocketAddress At(const std::string& host, std::uint16_t port) { return {AddressOf(host), port}; }
  bool Scripted(const std::string& operation) { return failures_.TakeScripted(operation); }
  std::int32_t Refused(std::int32_t error) { return failures_.Refuse(error); }
  /// nullptr, with the last error set, for a handle that is no open socket.
  End Find(SocketHandle socket);
  std::int32_t Read(SocketEnd& end, std::span<std::uint8_t> buffer, std::int32_t flags, SocketAddress& from);

  Core& core_;
  int started_ = 0;
  SocketFailures failures_;
  SocketMessages messages_;
  SocketTable table_;
  SimulatedStreams streams_;
  SimulatedConnections connections_;
  SimulatedDatagrams datagrams_;
  SimulatedLookUps lookUps_;
  ScriptedReads scriptedReads_;
};

} // namespace quendra::platform::simulated
