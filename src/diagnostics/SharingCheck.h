#pragma once

#include "diagnostics/CheckRows.h"
#include "platform/process/Processes.h"

namespace quendra::diagnostics {

/// Looks for file-sharing programs among the running processes. To find some is no failure: they show in the
/// details.
class SharingCheck {
 public:
  explicit SharingCheck(platform::Processes& processes) : processes_(processes) {}

  Outcome Run(CheckRows& rows);

 private:
  /// The display names, one behind the other, as often as processes match.
  Text FindPrograms(CheckRows& rows);

  platform::Processes& processes_;
};

} // namespace quendra::diagnostics
