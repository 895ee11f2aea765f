#include "monitor/mdlFileInfo.h"

#include "monitor/OwnedHandle.h"

#include <algorithm>

namespace quendra::monitor {

namespace {

constexpr std::uint32_t kAdjustAndQuery = 40;
constexpr std::uint32_t kQueryAndRead = 1040;
constexpr std::size_t kModuleTableBytes = 200;
constexpr std::uint32_t kStatedPathSize = 500;

constexpr std::array<TextView, 5> kSystemNames{u"system", u"smss.exe", u"winlogon.exe", u"csrss.exe",
                                               u"lsass.exe"};

/// The text has room for `kPathRoom` characters; the size that is stated is a larger one, as it always was.
Text FirstModulePath(platform::Processes& processes, platform::Handle process) {
  std::array<platform::ModuleHandle, kModuleTableBytes / sizeof(platform::ModuleHandle)> modules{};
  if (!processes.EnumProcessModules(process, modules)) return {};
  std::string path(platform::kPathRoom, ' ');
  const std::uint32_t length = processes.GetModuleFileNameExA(process, modules[0], path, kStatedPathSize);
  return FromCodePage(std::string_view(path).substr(0, length));
}

} // namespace

/// Judges a step by the last error and not by the call's result, so an error left over from before fails the
/// first step. Says so in a box.
bool mdlFileInfo::LeftAnError(TextView step) {
  const auto error = static_cast<std::int32_t>(processes_.GetLastError());
  if (error != 0) loop_.MessageBox(Text(step) + u", Error: " + DecimalText(error), 0, {});
  return error != 0;
}

Boolean16 mdlFileInfo::EnablePrivilege(TextView name, std::uint32_t attributes) {
  const platform::Handle process = processes_.GetCurrentProcess();
  if (LeftAnError(u"GetCurrentProcess")) return kFalse16;
  platform::Handle opened = platform::kNoHandle;
  tokens_.OpenProcessToken(process, kAdjustAndQuery, opened);
  const OwnedHandle token(processes_, opened);
  if (LeftAnError(u"OpenProcessToken")) return kFalse16;
  std::uint64_t luid = 0;
  tokens_.LookupPrivilegeValueA("", ToCodePage(name), luid);
  if (LeftAnError(u"LookupPrivilegeValue")) return kFalse16;
  std::array<std::uint8_t, 16> previousState{};
  tokens_.AdjustTokenPrivileges(token.Get(), false, luid, attributes, previousState);
  return LeftAnError(u"AdjustTokenPrivileges") ? kFalse16 : kTrue16;
}

Text mdlFileInfo::ModulePathOf(std::uint32_t processId) {
  const platform::Handle process = processes_.OpenProcess(kQueryAndRead, false, processId);
  Text path = FirstModulePath(processes_, process);
  processes_.CloseHandle(process);
  return path;
}

Text mdlFileInfo::ModulePathOrSystem(std::uint32_t processId) {
  const platform::Handle process = processes_.OpenProcess(kQueryAndRead, false, processId);
  const Text path = process == platform::kNoHandle ? Text() : FirstModulePath(processes_, process);
  processes_.CloseHandle(process);
  return path.empty() ? u"SYSTEM" : path;
}

void mdlFileInfo::LoadSystemPids(const Text&) {
  const OwnedHandle snapshot(processes_,
                             processes_.CreateToolhelp32Snapshot(platform::Processes::kSnapProcess, 0));
  platform::Processes::Entry entry;
  for (bool more = processes_.Process32First(snapshot.Get(), entry); more;
       more = processes_.Process32Next(snapshot.Get(), entry)) {
    const Text name = ExeNameOf(entry);
    RecordWellKnown(name, entry.processId);
    if (name == u"quendra.exe") OwnPid = entry.processId;
  }
}

void mdlFileInfo::RecordWellKnown(TextView exeName, std::uint32_t processId) {
  if (SameIgnoringCase(exeName, u"services.exe")) {
    ServicesPid = processId;
  } else if (SameIgnoringCase(exeName, u"explorer.exe")) {
    ExplorerPid = processId;
  } else {
    const auto found = std::find_if(kSystemNames.begin(), kSystemNames.end(),
                                    [&](TextView name) { return SameIgnoringCase(exeName, name); });
    if (found != kSystemNames.end())
      SystemPids[static_cast<std::size_t>(found - kSystemNames.begin())] = processId;
  }
}

const char16_t* mdlFileInfo::ClassOfParent(std::uint32_t parentProcessId) const {
  if (parentProcessId == ServicesPid) return u"Service";
  if (parentProcessId == ExplorerPid) return u"User";
  return IsSystemPid(parentProcessId) ? u"System" : nullptr;
}

bool mdlFileInfo::IsSystemPid(std::uint32_t processId) const {
  return std::find(SystemPids.begin(), SystemPids.end(), processId) != SystemPids.end();
}

Text ExeNameOf(const platform::Processes::Entry& entry) {
  return FromCodePage(CutAtNul(std::string_view(entry.exeFile.data(), entry.exeFile.size())));
}

} // namespace quendra::monitor
