#pragma once

#include "platform/linux/process/HandleTable.h"
#include "platform/linux/process/ProcessList.h"
#include "platform/linux/system/SystemPaths.h"
#include "platform/process/Processes.h"

namespace quendra::platform::linux_ {

/// Processes from /proc. A process can be opened by everybody; its one module, the executable, is known only
/// to those who may look at the process, and only where its path leads to it.
class LinuxProcesses : public Processes {
 public:
  LinuxProcesses(const ProcFolder& folder, HandleTable& handles, SystemPaths& paths,
                 Clock clock = CoarseMilliseconds);

  Handle CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t processId) override;
  bool Process32First(Handle snapshot, Entry& entry) override;
  bool Process32Next(Handle snapshot, Entry& entry) override;
  Handle OpenProcess(std::uint32_t access, bool inherit, std::uint32_t processId) override;
  Handle GetCurrentProcess() override;
  bool CloseHandle(Handle handle) override;
  bool EnumProcessModules(Handle process, std::span<ModuleHandle> modules) override;
  std::uint32_t GetModuleFileNameExA(Handle process, ModuleHandle module, std::string& path,
                                     std::uint32_t size) override;
  bool TerminateProcess(Handle process, std::uint32_t exitCode) override;
  std::uint32_t GetLastError() override { return handles_.lastError; }

 private:
  bool Fail(std::uint32_t error);
  /// Every call that succeeds leaves no error.
  bool Succeed();
  /// By which the process of that folder can be ended; nothing, with the error, when it may not be ended or
  /// isn't the one that the last snapshot showed under its id.
  Descriptor OpenToEnd(std::uint32_t processId, const Descriptor& folder);
  bool NextOf(Snapshot* snapshot, Entry& entry);
  std::optional<std::string> ExecutableOf(Handle process);

  const ProcFolder& folder_;
  HandleTable& handles_;
  SystemPaths& paths_;
  ProcessList list_;
};

} // namespace quendra::platform::linux_
