#pragma once

#include "platform/system/System.h"

namespace quendra::monitor {

/// The numeric version of the system: 32, 95, 98, 351, 40, 2000 or 2002, and 0 for all that have no number.
std::int32_t OsVersionCodeOf(const platform::OsVersion& version);

} // namespace quendra::monitor
