#pragma once

#include "forms/MessageLoop.h"
#include "platform/process/Processes.h"
#include "platform/process/Tokens.h"
#include "platform/process/VersionInfo.h"
#include "runtime/Integers.h"

#include <array>

namespace quendra::monitor {

/// The version record of an executable file. A field that the file's version block lacks holds "?"; a file
/// without a version block has all fields empty.
struct FileVersionInfo {
  Text CompanyName;
  Text FileDescription;
  Text FileVersion;
  Text InternalName;
  Text LegalCopyright;
  Text OriginalFileName;
  Text ProductName;
  Text ProductVersion;
};

/// What the monitor knows of a process beyond its id. Process ids have 32 bits here, all together.
class mdlFileInfo {
 public:
  mdlFileInfo(platform::Processes& processes, platform::Tokens& tokens, platform::VersionInfo& versions,
              forms::MessageLoop& loop)
      : processes_(processes), tokens_(tokens), versions_(versions), loop_(loop) {}

  /// True when no step left an error. A step that left one says so in a message box.
  Boolean16 EnablePrivilege(TextView name, std::uint32_t attributes = platform::Tokens::kEnabled);
  /// The path of the process's first module, empty when it can't be had.
  Text ModulePathOf(std::uint32_t processId);
  /// The same with "SYSTEM" in place of an empty path.
  Text ModulePathOrSystem(std::uint32_t processId);
  FileVersionInfo ReadFileVersionInfo(const Text& path);
  /// The file's product name, with the system's own name made short.
  Text ApplicationNameOf(const Text& path);
  /// Walks a snapshot of its own for the well-known ids and for OwnPid. The reason is ignored.
  void LoadSystemPids(const Text& reason);

  /// Remembers the well-known process of this name, compared without regard to case. Other names are passed
  /// over.
  void RecordWellKnown(TextView exeName, std::uint32_t processId);
  /// "Service", "User" or "System" for a child of a well-known process; nullptr for any other parent. A
  /// well-known process that wasn't seen yet has the id 0, so children of 0 count as its own.
  const char16_t* ClassOfParent(std::uint32_t parentProcessId) const;
  bool IsSystemPid(std::uint32_t processId) const;

  std::uint32_t ServicesPid = 0;
  std::uint32_t ExplorerPid = 0;
  std::array<std::uint32_t, 5> SystemPids{}; ///< system, smss.exe, winlogon.exe, csrss.exe, lsass.exe
  std::uint32_t OwnPid = 0;

 private:
  bool LeftAnError(TextView step);

  platform::Processes& processes_;
  platform::Tokens& tokens_;
  platform::VersionInfo& versions_;
  forms::MessageLoop& loop_;
};

/// A snapshot entry's executable name, cut at its first NUL; the whole field when it holds none.
Text ExeNameOf(const platform::Processes::Entry& entry);

} // namespace quendra::monitor
