#pragma once

#include "platform/system/ShellStart.h"

namespace quendra::platform::windows {

/// Starts programs as the run-time's Shell does: by their command line, as processes of their own. A program
/// without a path is one of the system's or stands in PATH; a file of its name that lies beside this program
/// or in the working folder is never started.
class WindowsShellStart : public ShellStart {
 public:
  bool Shell(const std::string& commandLine, int windowStyle) override;
};

} // namespace quendra::platform::windows
