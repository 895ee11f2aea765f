#pragma once

#include "runtime/Text.h"

#include <cstdint>

namespace quendra::platform {
class Files;
class Processes;
class ShellStart;
} // namespace quendra::platform

namespace quendra::mail {

/// Makes accounts of Outlook XP, 2000 and 2003: by a profile file, which the system opens with the program
/// that it belongs to.
class OutlookProfile {
 public:
  OutlookProfile(platform::Files& files, platform::ShellStart& shell, platform::Processes& processes)
      : files_(files), shell_(shell), processes_(processes) {}

  /// 0 for success; else the length of the Windows directory's name, which must be 10, with nothing written.
  /// Raises the fault of a file that can't be written, and fault 53 when nothing can be started.
  std::int32_t CreateOutlookProfile(const Text& userName, const Text& fullName);

 private:
  platform::Files& files_;
  platform::ShellStart& shell_;
  platform::Processes& processes_;
};

} // namespace quendra::mail
