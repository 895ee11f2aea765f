#pragma once

#include "platform/net/Ipv4Address.h"
#include "platform/net/SocketNumbers.h"
#include "platform/net/dormant/BlockingCalls.h"
#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <span>
#include <string>

namespace quendra::platform {

using SocketHandle = OpaqueHandle<struct SocketKind>;
inline constexpr SocketHandle kNoSocket{0xFFFFFFFF};

/// A look-up of a name that is under way.
using LookUpHandle = OpaqueHandle<struct LookUpKind>;
inline constexpr LookUpHandle kNoLookUp;

/// What is no address; as an address it is 255.255.255.255.
inline constexpr Ipv4Address kNoAddress = Ipv4Address::FromMemory(0xFFFFFFFF);

/// An address and a port in host order.
struct SocketAddress {
  Ipv4Address address;
  std::uint16_t port = 0;
  friend bool operator==(const SocketAddress&, const SocketAddress&) = default;
};

/// Winsock 1.1 with its notification by window messages. Numbers that fail give kSocketError (or kNoSocket)
/// and leave the reason for WSAGetLastError.
///
/// WSAAsyncSelect makes the socket non-blocking and announces each event of the mask as the message, with the
/// socket as wParam, the event in the low and an error number in the high word of lParam. An event is
/// announced once until the call that re-enables it: FD_READ until recv or recvfrom (and again at once while
/// data remains), FD_WRITE after the connection and after a send that was refused with kWouldBlock, FD_ACCEPT
/// until accept (again while connections wait), FD_CONNECT once, FD_CLOSE once, after the last data was read.
/// An accepted socket has its listener's selection.
class Sockets : public BlockingCalls {
 public:
  /// 0, or the reason itself. `version` is the minor version in the high byte and the major one in the low.
  virtual std::int32_t WSAStartup(std::uint16_t version) = 0;
  virtual std::int32_t WSACleanup() = 0;
  virtual std::int32_t WSAGetLastError() = 0;

  virtual SocketHandle socket(std::int32_t family, std::int32_t type, std::int32_t protocol) = 0;
  virtual std::int32_t closesocket(SocketHandle socket) = 0;
  virtual std::int32_t bind(SocketHandle, const SocketAddress&) = 0;
  virtual std::int32_t listen(SocketHandle, std::int32_t backlog) = 0;
  virtual SocketHandle accept(SocketHandle) = 0;
  virtual std::int32_t connect(SocketHandle, const SocketAddress&) = 0;
  virtual std::int32_t getsockname(SocketHandle, SocketAddress&) = 0;
  virtual std::int32_t getpeername(SocketHandle, SocketAddress&) = 0;
  virtual std::int32_t getsockopt(SocketHandle, std::int32_t level, std::int32_t option,
                                  std::int32_t& value) = 0;
  virtual std::int32_t setsockopt(SocketHandle, std::int32_t level, std::int32_t option,
                                  std::int32_t value) = 0;
  /// Command kBytesWaiting: the bytes of the stream, or of the next datagram, that wait.
  virtual std::int32_t ioctlsocket(SocketHandle, std::uint32_t command, std::uint32_t& value) = 0;

  /// The number of bytes taken by the system.
  virtual std::int32_t send(SocketHandle, std::span<const std::uint8_t> bytes, std::int32_t flags) = 0;
  virtual std::int32_t sendto(SocketHandle, std::span<const std::uint8_t> bytes, std::int32_t flags,
                              const SocketAddress&) = 0;
  /// The number of bytes read, 0 at the end of the stream. kPeek leaves them there.
  virtual std::int32_t recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) = 0;
  /// A datagram longer than the buffer fills it and fails with kMessageTooLong.
  virtual std::int32_t recvfrom(SocketHandle, std::span<std::uint8_t> buffer, std::int32_t flags,
                                SocketAddress& from) = 0;

  virtual std::int32_t WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                                      std::int32_t events) = 0;
  /// Starts a look-up and gives its handle, kNoLookUp on failure. When it ends the window gets the message
  /// with the handle as wParam and an error number in the high word of lParam; without an error `buffer`
  /// starts with the count of the name's addresses (32 bits, low byte first) and the addresses as they lie in
  /// memory.
  virtual LookUpHandle WSAAsyncGetHostByName(WindowHandle window, std::uint32_t message,
                                             const std::string& name, std::span<std::uint8_t> buffer) = 0;
  /// 0 when the look-up was under way: its message will not come and its buffer is not touched any more.
  virtual std::int32_t WSACancelAsyncRequest(LookUpHandle lookUp) = 0;

  /// The address of a dotted text, kNoAddress for any other text. The library's own rules: one to four parts,
  /// the last of which fills what is left, each in decimal, octal (leading 0) or hexadecimal (leading 0x).
  static Ipv4Address inet_addr(const std::string& text);
};

} // namespace quendra::platform
