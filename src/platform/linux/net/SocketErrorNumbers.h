#pragma once

#include <cstdint>

namespace quendra::platform::linux_ {

/// The socket library's number for one of this system's: kSubsystemUnavailable for what the library has no
/// name for.
std::int32_t SocketErrorOf(int systemError);

/// Likewise for what a name look-up ends with; 0 for success.
std::int32_t LookUpErrorOf(int lookUpError);

} // namespace quendra::platform::linux_
