#pragma once

#include "platform/process/Processes.h"
#include "platform/process/SystemErrors.h"

namespace quendra::platform::unavailable {

/// A system without a process list. The last error is always that of a call that doesn't exist.
class UnavailableProcesses : public Processes {
 public:
  Handle CreateToolhelp32Snapshot(std::uint32_t, std::uint32_t) override { return kInvalidHandle; }
  bool Process32First(Handle, Entry&) override { return false; }
  bool Process32Next(Handle, Entry&) override { return false; }
  Handle OpenProcess(std::uint32_t, bool, std::uint32_t) override { return kNoHandle; }
  Handle GetCurrentProcess() override { return kOwnProcess; }
  bool CloseHandle(Handle) override { return false; }
  bool EnumProcessModules(Handle, std::span<ModuleHandle>) override { return false; }
  std::uint32_t GetModuleFileNameExA(Handle, ModuleHandle, std::string&, std::uint32_t) override { return 0; }
  bool TerminateProcess(Handle, std::uint32_t) override { return false; }
  std::uint32_t GetLastError() override { return kCallNotImplemented; }
};

} // namespace quendra::platform::unavailable
