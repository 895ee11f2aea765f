#pragma once

#include <cstdint>
#include <span>

namespace quendra::platform {

using SocketHandle = std::uint32_t;

/// Winsock operations, as far as the program's parts ask for them so far.
class Sockets {
 public:
  virtual ~Sockets() = default;

  /// The number of bytes read, 0 at the end of the stream, -1 on failure.
  virtual std::int32_t recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) = 0;
  virtual std::int32_t WSAAsyncSelect(SocketHandle socket, std::uint32_t window, std::uint32_t message,
                                      std::int32_t events) = 0;
  virtual std::int32_t closesocket(SocketHandle socket) = 0;
  virtual bool WSAIsBlocking() = 0;
  virtual std::int32_t WSACancelBlockingCall() = 0;
  virtual std::int32_t WSACleanup() = 0;
};

} // namespace quendra::platform
