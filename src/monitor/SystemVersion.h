#pragma once

#include "forms/MessageLoop.h"
#include "platform/system/System.h"

namespace quendra::monitor {

/// Which system the program runs on.
class SystemVersion {
 public:
  SystemVersion(platform::System& system, forms::MessageLoop& loop) : system_(system), loop_(loop) {}

  /// Part of the main window's load. A version that can't be read is told in a box and counts as 0.
  void Read();

  std::int32_t OsVersionCode = 0; ///< 0, 32, 95, 98, 351, 40, 2000 or 2002

 private:
  platform::System& system_;
  forms::MessageLoop& loop_;
};

} // namespace quendra::monitor
