#include "platform/linux/net/SocketErrorNumbers.h"

#include "platform/net/SocketNumbers.h"

#include <netdb.h>

#include <algorithm>
#include <cerrno>
#include <iterator>

namespace quendra::platform::linux_ {

namespace {

struct Number {
  int system;
  std::int32_t library;
};

constexpr Number kNumbers[] = {
    {EINTR, kInterrupted},
    {EBADF, kNotASocket},
    {EACCES, kPermissionDenied},
    {EPERM, kPermissionDenied},
    {EFAULT, kBadAddress},
    {EINVAL, kInvalidArgument},
    {EMFILE, kTooManyFiles},
    {ENFILE, kTooManyFiles},
    {EAGAIN, kWouldBlock},
    {EINPROGRESS, kWouldBlock},
    {EALREADY, kAlreadyInProgress},
    {ENOTSOCK, kNotASocket},
    {EDESTADDRREQ, kDestinationRequired},
    {EMSGSIZE, kMessageTooLong},
    {EPROTOTYPE, kWrongProtocolType},
    {ENOPROTOOPT, kBadProtocolOption},
    {EPROTONOSUPPORT, kProtocolNotSupported},
    {ESOCKTNOSUPPORT, kSocketTypeNotSupported},
    {EOPNOTSUPP, kOperationNotSupported},
    {EPFNOSUPPORT, kProtocolFamilyNotSupported},
    {EAFNOSUPPORT, kFamilyNotSupported},
    {EADDRINUSE, kAddressInUse},
    {EADDRNOTAVAIL, kAddressNotAvailable},
    {ENETDOWN, kNetworkDown},
    {ENETUNREACH, kNetworkUnreachable},
    {ENETRESET, kNetworkReset},
    {ECONNABORTED, kConnectionAborted},
    {ECONNRESET, kConnectionReset},
    {EPIPE, kConnectionReset},
    {ENOBUFS, kNoBufferSpace},
    {ENOMEM, kNoBufferSpace},
    {ENOSPC, kNoBufferSpace},
    {EISCONN, kAlreadyConnected},
    {ENOTCONN, kNotConnected},
    {ESHUTDOWN, kSocketShutDown},
    {ETIMEDOUT, kConnectionTimedOut},
    {ECONNREFUSED, kConnectionRefused},
    {EHOSTUNREACH, kHostUnreachable},
    {EHOSTDOWN, kHostUnreachable},
    {EUSERS, kTooManyProcesses},
};

} // namespace

std::int32_t SocketErrorOf(int systemError) {
  if (systemError == 0) return 0;
  const auto found = std::find_if(std::begin(kNumbers), std::end(kNumbers),
                                  [&](const Number& row) { return row.system == systemError; });
  return found == std::end(kNumbers) ? kSubsystemUnavailable : found->library;
}

std::int32_t LookUpErrorOf(int lookUpError) {
  switch (lookUpError) {
  case 0: return 0;
  case EAI_AGAIN: return kNameServerSilent;
  case EAI_FAIL:
  case EAI_MEMORY:
  case EAI_SYSTEM: return kNameServerFailed;
  case EAI_NODATA: return kNameWithoutAddress;
  default: return kHostNotFound;
  }
}

} // namespace quendra::platform::linux_
