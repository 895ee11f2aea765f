#pragma once

#include "forms/Desktop.h"
#include "platform/Machine.h"
#include "runtime/Integers.h"

#include <array>

namespace quendra::monitor {

/// The version record of an executable file. A field that the file's version block lacks holds "?"; a file without a
/// version block has all fields empty.
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
  mdlFileInfo(const platform::Machine& machine, forms::Desktop& desktop) : machine_(machine), desktop_(desktop) {}

  Boolean16 EnablePrivilege(TextView name, std::uint32_t attributes = 2);
  Text ModulePathOf(std::uint32_t processId);
  Text ModulePathOrSystem(std::uint32_t processId);
  FileVersionInfo ReadFileVersionInfo(const Text& path);
  Text ApplicationNameOf(const Text& path);
  void LoadSystemPids(const Text& reason);

  /// Remembers the well-known process of this name, compared without regard to case. Other names are passed over.
  void RecordWellKnown(TextView exeName, std::uint32_t processId);
  /// "Service", "User" or "System" for a child of a well-known process seen so far; nullptr for any other parent.
  const char16_t* ClassOfParent(std::uint32_t parentProcessId) const;
  bool IsSystemPid(std::uint32_t processId) const;

  std::uint32_t ServicesPid = 0;
  std::uint32_t ExplorerPid = 0;
  std::array<std::uint32_t, 5> SystemPids{};  ///< system, smss.exe, winlogon.exe, csrss.exe, lsass.exe
  std::uint32_t OwnPid = 0;

 private:
  platform::Machine machine_;
  forms::Desktop& desktop_;
};

} // namespace quendra::monitor
