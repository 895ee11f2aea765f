#include "foundation/SocketErrors.h"

#include "platform/net/SocketNumbers.h"

#include <algorithm>
#include <iterator>

namespace quendra::foundation {

namespace {

struct ErrorText {
  std::int32_t number;
  const char16_t* text;
};

constexpr ErrorText kSystemErrors[] = {
    {platform::kInterrupted, u"Interrupted function call."},
    {platform::kPermissionDenied, u"Permission denied."},
    {platform::kBadAddress, u"Bad address."},
    {platform::kInvalidArgument, u"Invalid argument."},
    {platform::kTooManyFiles, u"Too many open files."},
    {platform::kWouldBlock, u"Resource temporarily unavailable."},
    {platform::kInProgress, u"Operation now in progress."},
    {platform::kAlreadyInProgress, u"Operation already in progress."},
    {platform::kNotASocket, u"Socket operation on nonsocket."},
    {platform::kDestinationRequired, u"Destination address required."},
    {platform::kMessageTooLong, u"Message too long."},
    {platform::kWrongProtocolType, u"Protocol wrong type for socket."},
    {platform::kBadProtocolOption, u"Bad protocol option."},
    {platform::kProtocolNotSupported, u"Protocol not supported."},
    {platform::kSocketTypeNotSupported, u"Socket type not supported."},
    {platform::kOperationNotSupported, u"Operation not supported."},
    {platform::kProtocolFamilyNotSupported, u"Protocol family not supported."},
    {platform::kFamilyNotSupported, u"Address family not supported by protocol family."},
    {platform::kAddressInUse, u"Address already in use."},
    {platform::kAddressNotAvailable, u"Cannot assign requested address."},
    {platform::kNetworkDown, u"Network is down."},
    {platform::kNetworkUnreachable, u"Network is unreachable."},
    {platform::kNetworkReset, u"Network dropped connection on reset."},
    {platform::kConnectionAborted, u"Software caused connection abort."},
    {platform::kConnectionReset, u"Connection reset by peer."},
    {platform::kNoBufferSpace, u"No buffer space available."},
    {platform::kAlreadyConnected, u"Socket is already connected."},
    {platform::kNotConnected, u"Socket is not connected."},
    {platform::kSocketShutDown, u"Cannot send after socket shutdown."},
    {platform::kConnectionTimedOut, u"Connection timed out."},
    {platform::kConnectionRefused, u"Connection refused."},
    {platform::kHostUnreachable, u"No route to host."},
    {platform::kTooManyProcesses, u"Too many processes."},
    {platform::kSubsystemUnavailable, u"Network subsystem is unavailable."},
    {platform::kVersionNotSupported, u"Winsock.dll version out of range."},
    {platform::kNotStarted, u"Successful WSAStartup not yet performed."},
    {platform::kHostNotFound, u"Host not found."},
    {platform::kNameServerSilent, u"Nonauthoritative host not found."},
    {platform::kNameServerFailed, u"This is a nonrecoverable error."},
    {platform::kNameWithoutAddress, u"Valid name, no data record of requested type."},
};

constexpr ErrorText kMisuses[] = {
    {kWrongProtocolOrState, u"Wrong protocol or connection state for the requested transaction or request"},
    {kInvalidArgumentFault,
     u"The argument passed to a function was not in the correct format or in the specified range."},
    {kUnsupportedType, u"Unsupported variant type."},
    {kInvalidAtCurrentState, u"Invalid operation at current state"},
    {kUnsupportedIndexType, u"Unsupported index type."},
    {kUnknownIndex, u"Unknown index."},
};

template <std::size_t count>
const ErrorText* FindError(const ErrorText (&table)[count], std::int32_t number) {
  const auto found = std::find_if(std::begin(table), std::end(table),
                                  [&](const ErrorText& row) { return row.number == number; });
  return found == std::end(table) ? nullptr : found;
}

} // namespace

Text SystemErrorText(std::int32_t number) {
  const ErrorText* row = FindError(kSystemErrors, number);
  return row ? row->text : u"Unknown error.";
}

Fault SystemError(std::int32_t number, Text source) {
  return Fault(number, SystemErrorText(number), std::move(source));
}

Fault Misuse(SocketMisuse number, Text source) {
  return Fault(number, FindError(kMisuses, number)->text, std::move(source));
}

} // namespace quendra::foundation
