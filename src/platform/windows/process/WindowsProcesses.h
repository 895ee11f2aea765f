#pragma once

#include "platform/windows/process/ImagePath.h"
#include "platform/windows/process/LastError.h"
#include "platform/windows/process/SystemHandle.h"
#include "platform/windows/system/LazyLibrary.h"

namespace quendra::platform::windows {

/// The process list as the tool help calls give it; modules by psapi.
class WindowsProcesses : public Processes {
 public:
  explicit WindowsProcesses(LastError& lastError) : lastError_(lastError) {}

  Handle CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t processId) override;
  bool Process32First(Handle snapshot, Entry& entry) override;
  bool Process32Next(Handle snapshot, Entry& entry) override;
  Handle OpenProcess(std::uint32_t access, bool inherit, std::uint32_t processId) override;
  /// Leaves the error that is there, as the system does.
  Handle GetCurrentProcess() override { return kOwnProcess; }
  bool CloseHandle(Handle handle) override;
  bool EnumProcessModules(Handle process, std::span<ModuleHandle> modules) override;
  std::uint32_t GetModuleFileNameExA(Handle process, ModuleHandle module, std::string& path,
                                     std::uint32_t size) override;
  bool TerminateProcess(Handle process, std::uint32_t exitCode) override;
  std::uint32_t GetLastError() override { return lastError_.value; }

 private:
  template <typename Function> Function* FindInPsapi(const char* name);
  Text PathOfProgram(Handle process);
  Text PathOfModule(Handle process, ModuleHandle module);

  LastError& lastError_;
  LazyLibrary psapi_{L"psapi.dll"};
  ImagePath imagePath_;
};

} // namespace quendra::platform::windows
