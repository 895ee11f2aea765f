#include "platform/linux/remote_access/RasErrorTexts.h"

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>
#include <array>

namespace quendra::platform::linux_ {

namespace {

struct ErrorText {
  std::uint32_t number;
  std::string_view text;
};

constexpr std::array kTexts{
    ErrorText{kRasInvalidPortHandle, "The port handle is invalid."},
    ErrorText{kRasBufferTooSmall, "The caller's buffer is too small."},
    ErrorText{kRasBufferInvalid, "The buffer is invalid."},
    ErrorText{kRasCannotFindPhonebookEntry, "Cannot find the phone book entry."},
    ErrorText{kRasPortDisconnected, "The port was disconnected."},
    ErrorText{kRasUserDisconnection, "The port was disconnected by the user."},
    ErrorText{kRasInvalidSize, "The structure size is incorrect."},
    ErrorText{kRasPortNotAvailable,
              "The port is already in use or is not configured for Remote Access dialout."},
    ErrorText{kRasNoAnswer, "There is no answer."},
    ErrorText{kRasAuthenticationFailure,
              "Access denied because username and/or password is invalid on the domain."},
    ErrorText{kRasManagerCannotStart, "The Remote Access Service Manager could not start."},
    ErrorText{kRasPppTimeout, "Timed out waiting for a valid response from the remote PPP peer."},
    ErrorText{kRasPppNotConverging, "No PPP control protocols configured."},
};

} // namespace

std::string_view RasErrorText(std::uint32_t number) {
  const auto found = std::ranges::find(kTexts, number, &ErrorText::number);
  return found == kTexts.end() ? std::string_view() : found->text;
}

} // namespace quendra::platform::linux_
