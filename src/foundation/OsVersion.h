#pragma once

#include "forms/MessageLoop.h"
#include "platform/system/System.h"

namespace quendra::foundation {

/// The system as the program calls it.
struct OsVersion {
  /// 32, 95, 98, 351, 40, 2000 or 2002; 0 for a system of another kind.
  std::int32_t code = 0;
  Text name{};    ///< as in "Windows XP"
  Text version{}; ///< as in "5.1"
  Text build{};   ///< as in "2600"
};

/// A version of a known kind that is not listed leaves name and code alone.
void Describe(const platform::OsVersion& told, OsVersion& version);
/// Asks the system. False when it doesn't tell its version, which a box says.
bool ReadOsVersion(platform::System& system, forms::MessageLoop& loop, OsVersion& version);

} // namespace quendra::foundation
