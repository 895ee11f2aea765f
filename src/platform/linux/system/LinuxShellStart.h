#pragma once

#include "platform/linux/system/SystemPaths.h"
#include "platform/system/ShellStart.h"

#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// Starts programs found through PATH, without a shell between, in a session of their own and as nobody's
/// children.
/// The system's own command lines for a file in its folder and for adding programs have what stands for them
/// here: the session's file manager, else the folder itself, and its software centre.
class LinuxShellStart : public ShellStart {
 public:
  explicit LinuxShellStart(const SystemPaths& paths) : paths_(paths) {}

  bool Shell(const std::string& commandLine, int windowStyle) override;

 private:
  const SystemPaths& paths_;
};

/// The words of a command line: parted by blanks, which double quotes keep together.
std::vector<std::string> CommandWords(std::string_view commandLine);

} // namespace quendra::platform::linux_
