#pragma once

#include "platform/process/SystemErrors.h"
#include "winapi/Winapi.h"

#include <cstdint>

namespace quendra::platform::windows {

/// The error that the last of the program's own questions about processes left. The system's number lasts
/// only until the next call, which may be one of the run-time's, so it is taken at once.
class LastError {
 public:
  /// Right after a call: takes its error when it failed, none when it succeeded.
  bool Succeeded(bool succeeded) {
    value = succeeded ? DWORD{kNoError} : ::GetLastError();
    return succeeded;
  }

  std::uint32_t value = kNoError;
};

} // namespace quendra::platform::windows
