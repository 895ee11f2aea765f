#pragma once

#include "platform/system/ShellStart.h"

#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// Starts programs found through PATH, without a shell between, in a session of their own and as nobody's
/// children.
class LinuxShellStart : public ShellStart {
 public:
  bool Shell(const std::string& commandLine, int windowStyle) override;
};

/// The words of a command line: parted by blanks, which double quotes keep together.
std::vector<std::string> CommandWords(std::string_view commandLine);

} // namespace quendra::platform::linux_
