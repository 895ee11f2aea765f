#include "platform/windows/process/WindowsProcesses.h"

#include "platform/windows/process/PathInCodePage.h"

#include <psapi.h>
#include <tlhelp32.h>

#include <algorithm>
#include <vector>

#undef Process32First
#undef Process32Next

namespace quendra::platform::windows {

namespace {

/// Longer than any path that a module can be loaded from in a program of that time.
constexpr std::size_t kModulePathRoom = 1024;

/// In place of a module: the program itself.
constexpr ModuleHandle kWholeProgram;

using Walk = decltype(::Process32FirstW);

bool Step(Walk& walk, Handle snapshot, Processes::Entry& entry) {
  PROCESSENTRY32W told{};
  told.dwSize = sizeof told;
  if (!walk(ToSystem(snapshot), &told)) return false;
  entry.processId = told.th32ProcessID;
  entry.parentProcessId = told.th32ParentProcessID;
  told.szExeFile[MAX_PATH - 1] = L'\0';
  const std::string name = ToCodePage(winapi::TextOf(told.szExeFile));
  entry.exeFile.fill('\0');
  std::ranges::copy(name, entry.exeFile.begin());
  return true;
}

} // namespace

Handle WindowsProcesses::CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t processId) {
  const HANDLE snapshot = ::CreateToolhelp32Snapshot(flags, processId);
  lastError_.Succeeded(snapshot != INVALID_HANDLE_VALUE);
  return FromSystem(snapshot);
}

bool WindowsProcesses::Process32First(Handle snapshot, Entry& entry) {
  return lastError_.Succeeded(Step(::Process32FirstW, snapshot, entry));
}

bool WindowsProcesses::Process32Next(Handle snapshot, Entry& entry) {
  return lastError_.Succeeded(Step(::Process32NextW, snapshot, entry));
}

Handle WindowsProcesses::OpenProcess(std::uint32_t access, bool inherit, std::uint32_t processId) {
  const HANDLE process = ::OpenProcess(access, inherit, processId);
  lastError_.Succeeded(process != nullptr);
  return FromSystem(process);
}

bool WindowsProcesses::CloseHandle(Handle handle) {
  return lastError_.Succeeded(::CloseHandle(ToSystem(handle)) != FALSE);
}

template <typename Function> Function* WindowsProcesses::FindInPsapi(const char* name) {
  const auto call = psapi_.Find<Function>(name);
  if (!call) lastError_.value = kCallNotImplemented;
  return call;
}

bool WindowsProcesses::EnumProcessModules(Handle process, std::span<ModuleHandle> modules) {
  const auto enumerate = FindInPsapi<decltype(::EnumProcessModules)>("EnumProcessModules");
  if (!enumerate) return false;
  std::vector<HMODULE> found(modules.size());
  DWORD needed = 0;
  const bool known =
      enumerate(ToSystem(process), found.data(), static_cast<DWORD>(found.size() * sizeof(HMODULE)), &needed);
  if (!lastError_.Succeeded(known)) {
    // One of 32 bits is told no more of a program of 64.
    if (lastError_.value != kPartialCopy || !imagePath_.IsThere()) return false;
    std::ranges::fill(modules, kWholeProgram);
    return lastError_.Succeeded(true);
  }
  std::ranges::transform(found, modules.begin(), [](HMODULE module) {
    return ModuleHandle(static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(module)));
  });
  return true;
}

Text WindowsProcesses::PathOfProgram(Handle process) {
  Text path = imagePath_.Of(process);
  lastError_.Succeeded(!path.empty());
  return path;
}

Text WindowsProcesses::PathOfModule(Handle process, ModuleHandle module) {
  const auto getName = FindInPsapi<decltype(::GetModuleFileNameExW)>("GetModuleFileNameExW");
  if (!getName) return {};
  std::vector<wchar_t> found(kModulePathRoom);
  const DWORD length = getName(ToSystem(process), reinterpret_cast<HMODULE>(std::uintptr_t{module.Value()}),
                               found.data(), static_cast<DWORD>(found.size()));
  if (!lastError_.Succeeded(length > 0)) return {};
  return WithoutKernelsNames(winapi::TextOf(found.data(), std::min(std::size_t{length}, found.size())),
                             winapi::SystemFolder());
}

std::uint32_t WindowsProcesses::GetModuleFileNameExA(Handle process, ModuleHandle module, std::string& path,
                                                     std::uint32_t size) {
  const Text found = module == kWholeProgram && imagePath_.IsThere() ? PathOfProgram(process)
                                                                     : PathOfModule(process, module);
  const std::string name = PathInCodePage(found);
  const std::size_t written = std::min({name.size(), path.size(), std::size_t{size}});
  std::copy_n(name.begin(), written, path.begin());
  return static_cast<std::uint32_t>(written);
}

bool WindowsProcesses::TerminateProcess(Handle process, std::uint32_t exitCode) {
  return lastError_.Succeeded(::TerminateProcess(ToSystem(process), exitCode) != FALSE);
}

} // namespace quendra::platform::windows
