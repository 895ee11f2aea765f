#pragma once

#include <cstddef>
#include <cstdint>

/// The published numbers of Winsock 1.1, as far as the program or a backend names them; others pass through.
namespace quendra::platform {

/// What a number that fails is; the reason stands in WSAGetLastError.
inline constexpr std::int32_t kSocketError = -1;

/// Events of WSAAsyncSelect, as its mask and its messages number them.
enum SocketEvent : std::int32_t { kFdRead = 1, kFdWrite = 2, kFdAccept = 8, kFdConnect = 16, kFdClose = 32 };

/// The lParam of a socket's message (an event and an error number) and of a look-up's (no event).
constexpr std::uint32_t SocketMessageWord(std::int32_t event, std::int32_t error) {
  return static_cast<std::uint32_t>(event) | static_cast<std::uint32_t>(error) << 16;
}
constexpr std::int32_t EventOfMessage(std::uint32_t lParam) {
  return static_cast<std::int32_t>(lParam & 0xFFFF);
}
constexpr std::int32_t ErrorOfMessage(std::uint32_t lParam) {
  return static_cast<std::int32_t>(lParam >> 16);
}

/// What `socket` is asked for.
inline constexpr std::int32_t kInternetFamily = 2;
inline constexpr std::int32_t kStreamSocket = 1;
inline constexpr std::int32_t kDatagramSocket = 2;

/// Options and the one level at which they stand.
inline constexpr std::int32_t kSocketLevel = 0xFFFF;
enum SocketOption : std::int32_t {
  kReuseAddressOption = 0x0004,
  kBroadcastOption = 0x0020,
  kSendBufferOption = 0x1001,
  kReceiveBufferOption = 0x1002,
  kMaxMessageSizeOption = 0x2003,
};

/// The command of ioctlsocket, FIONREAD.
inline constexpr std::uint32_t kBytesWaiting = 0x4004667F;
/// The flag of recv and recvfrom.
inline constexpr std::int32_t kPeek = 2;
/// What a datagram holds at most.
inline constexpr std::int32_t kLargestDatagram = 65507;

enum SocketErrorNumber : std::int32_t {
  kInterrupted = 10004,
  kPermissionDenied = 10013,
  kBadAddress = 10014,
  kInvalidArgument = 10022,
  kTooManyFiles = 10024,
  kWouldBlock = 10035,
  kInProgress = 10036,
  kAlreadyInProgress = 10037,
  kNotASocket = 10038,
  kDestinationRequired = 10039,
  kMessageTooLong = 10040,
  kWrongProtocolType = 10041,
  kBadProtocolOption = 10042,
  kProtocolNotSupported = 10043,
  kSocketTypeNotSupported = 10044,
  kOperationNotSupported = 10045,
  kProtocolFamilyNotSupported = 10046,
  kFamilyNotSupported = 10047,
  kAddressInUse = 10048,
  kAddressNotAvailable = 10049,
  kNetworkDown = 10050,
  kNetworkUnreachable = 10051,
  kNetworkReset = 10052,
  kConnectionAborted = 10053,
  kConnectionReset = 10054,
  kNoBufferSpace = 10055,
  kAlreadyConnected = 10056,
  kNotConnected = 10057,
  kSocketShutDown = 10058,
  kConnectionTimedOut = 10060,
  kConnectionRefused = 10061,
  kHostUnreachable = 10065,
  kTooManyProcesses = 10067,
  kSubsystemUnavailable = 10091,
  kVersionNotSupported = 10092,
  kNotStarted = 10093,
  kHostNotFound = 11001,
  kNameServerSilent = 11002,
  kNameServerFailed = 11003,
  kNameWithoutAddress = 11004,
};

} // namespace quendra::platform
