#pragma once

#include "platform/net/Sockets.h"

namespace quendra::platform::unavailable {

/// A system without a network: the library does not start, and every call fails for that reason.
class UnavailableSockets : public Sockets {
 public:
  std::int32_t WSAStartup(std::uint16_t) override { return kSubsystemUnavailable; }
  std::int32_t WSACleanup() override { return kSocketError; }
  std::int32_t WSAGetLastError() override { return kSubsystemUnavailable; }

  SocketHandle socket(std::int32_t, std::int32_t, std::int32_t) override { return kNoSocket; }
  std::int32_t closesocket(SocketHandle) override { return kSocketError; }
  std::int32_t bind(SocketHandle, const SocketAddress&) override { return kSocketError; }
  std::int32_t listen(SocketHandle, std::int32_t) override { return kSocketError; }
  SocketHandle accept(SocketHandle) override { return kNoSocket; }
  std::int32_t connect(SocketHandle, const SocketAddress&) override { return kSocketError; }
  std::int32_t getsockname(SocketHandle, SocketAddress&) override { return kSocketError; }
  std::int32_t getpeername(SocketHandle, SocketAddress&) override { return kSocketError; }
  std::int32_t getsockopt(SocketHandle, std::int32_t, std::int32_t, std::int32_t&) override {
    return kSocketError;
  }
  std::int32_t setsockopt(SocketHandle, std::int32_t, std::int32_t, std::int32_t) override {
    return kSocketError;
  }
  std::int32_t ioctlsocket(SocketHandle, std::uint32_t, std::uint32_t&) override { return kSocketError; }
  std::int32_t send(SocketHandle, std::span<const std::uint8_t>, std::int32_t) override {
    return kSocketError;
  }
  std::int32_t sendto(SocketHandle, std::span<const std::uint8_t>, std::int32_t,
                      const SocketAddress&) override {
    return kSocketError;
  }
  std::int32_t recv(SocketHandle, std::span<std::uint8_t>, std::int32_t) override { return kSocketError; }
  std::int32_t recvfrom(SocketHandle, std::span<std::uint8_t>, std::int32_t, SocketAddress&) override {
    return kSocketError;
  }
  std::int32_t WSAAsyncSelect(SocketHandle, WindowHandle, std::uint32_t, std::int32_t) override {
    return kSocketError;
  }
  LookUpHandle WSAAsyncGetHostByName(WindowHandle, std::uint32_t, const std::string&,
                                     std::span<std::uint8_t>) override {
    return kNoLookUp;
  }
  std::int32_t WSACancelAsyncRequest(LookUpHandle) override { return kSocketError; }
  bool WSAIsBlocking() override { return false; }
  std::int32_t WSACancelBlockingCall() override { return kSocketError; }
};

} // namespace quendra::platform::unavailable
