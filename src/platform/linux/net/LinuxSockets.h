#pragma once

#include "platform/linux/net/NameLookUps.h"
#include "platform/linux/net/SocketNotifier.h"

namespace quendra::platform::linux_ {

/// Real sockets under the rules of the socket library.
class LinuxSockets : public Sockets {
 public:
  LinuxSockets(EventLoop& loop, DescriptorWatch& descriptors, HostNames& hostNames)
      : loop_(loop), notifier_(loop, descriptors), lookUps_(loop, hostNames) {}

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

  // Dormant. No call blocks here.

  bool WSAIsBlocking() override { return false; }
  std::int32_t WSACancelBlockingCall() override { return Fail(kInvalidArgument); }

 private:
  /// nullptr, with the last error set, when the library isn't started or the handle is no socket.
  SocketEntry* Entry(SocketHandle socket);
  std::int32_t Fail(std::int32_t error);
  SocketHandle FailSocket(std::int32_t error);
  std::int32_t FailWithErrno();
  std::int32_t Answer(std::int64_t result);

  EventLoop& loop_;
  SocketNotifier notifier_;
  NameLookUps lookUps_;
  int started_ = 0;
  std::int32_t lastError_ = 0;
};

} // namespace quendra::platform::linux_
