#pragma once

#include "diagnostics/LoadReadings.h"
#include "forms/MessageLoop.h"
#include "platform/net/IpHelper.h"

namespace quendra::diagnostics {

/// Sets all that the interfaces have carried against the speed of the last one. The figure is shown as a
/// load, though it grows with all traffic and is no rate.
class LineCheck {
 public:
  LineCheck(platform::IpHelper& ipHelper, platform::System& system, forms::MessageLoop& loop)
      : ipHelper_(ipHelper), system_(system), loop_(loop) {}

  Outcome Run(CheckRows& rows);

 private:
  platform::IpHelper& ipHelper_;
  platform::System& system_;
  forms::MessageLoop& loop_;
};

} // namespace quendra::diagnostics
