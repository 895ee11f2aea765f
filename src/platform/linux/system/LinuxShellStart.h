#pragma once

#include "platform/linux/files/DriveFolder.h"
#include "platform/linux/system/SystemPaths.h"
#include "platform/system/ShellStart.h"

#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// Starts programs found through PATH, without a shell between, in a session of their own and as nobody's
/// children.
/// The system's own command lines for a file in its folder and for adding programs have what stands for them
/// here: the session's file manager, else the folder itself, and its software centre. The command interpreter
/// is told of files alone, as in CMD /c "C:\WINDOWS\file": the desktop's opener opens them. Like any
/// interpreter it starts whether or not there is such a file and something that opens it.
class LinuxShellStart : public ShellStart {
 public:
  LinuxShellStart(const SystemPaths& paths, const DriveFolder& drive) : paths_(paths), drive_(drive) {}

  bool Shell(const std::string& commandLine, int windowStyle) override;

 private:
  const SystemPaths& paths_;
  const DriveFolder& drive_;
};

/// The words of a command line: parted by blanks, which double quotes keep together.
std::vector<std::string> CommandWords(std::string_view commandLine);

} // namespace quendra::platform::linux_
