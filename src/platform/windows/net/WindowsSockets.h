#pragma once

#include "platform/windows/net/HostLookUps.h"
#include "platform/windows/net/RelayWindow.h"
#include "platform/windows/net/SocketTable.h"

namespace quendra::platform::windows {

/// The system's sockets. Their messages come to one window of its own, which passes them on to the program's
/// windows by the loop, and only those that the rules of WSAAsyncSelect have: systems differ in how often
/// they tell an event, and whether they wait with the end of a connection until its data was read.
class WindowsSockets : public Sockets {
 public:
  WindowsSockets(EventLoop& loop, const SocketLibrary& library);
  ~WindowsSockets() override;

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

  // Dormant.

  bool WSAIsBlocking() override;
  std::int32_t WSACancelBlockingCall() override;

 private:
  /// nullptr, with the last error set, when the library isn't started or the handle is no socket.
  SocketEntry* Entry(SocketHandle socket);
  std::int32_t Fail(std::int32_t error);
  /// The library's answer; where that is a failure, its reason is kept.
  std::int32_t Answer(int result);
  bool Relay(SocketEntry& entry);
  void OnRelayed(UINT message, WPARAM wParam, LPARAM lParam);
  void OnEnd(SocketHandle socket, SocketEntry& entry, std::int32_t error);
  /// 1 while data waits, 0 at the end of the stream, below 0 the error that a read would fail with.
  std::int32_t NextByte(const SocketEntry& entry) const;
  void CloseAll();

  EventLoop& loop_;
  const SocketLibrary& library_;
  RelayWindow relay_;
  SocketTable table_;
  HostLookUps lookUps_;
  int started_ = 0;
  std::int32_t lastError_ = 0;
};

} // namespace quendra::platform::windows
