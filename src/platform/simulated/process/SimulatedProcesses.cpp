#include "platform/simulated/process/SimulatedProcesses.h"

#include "platform/process/SystemErrors.h"

#include <algorithm>

namespace quendra::platform::simulated {

namespace {

constexpr ModuleHandle kExecutableModule{0x00400000};

} // namespace

void SimulatedProcesses::End(std::uint32_t id) {
  std::erase_if(processes_, [&](const Process& process) { return process.id == id; });
}

Handle SimulatedProcesses::CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t) {
  if (FailSnapshots || !(flags & kSnapProcess)) return kInvalidHandle;
  ++SnapshotsTaken;
  const Handle snapshot = core_.Open(Core::Kind::Snapshot);
  snapshots_[snapshot] = {processes_, 0};
  return snapshot;
}

bool SimulatedProcesses::Process32First(Handle snapshot, Entry& entry) {
  const auto found = snapshots_.find(snapshot);
  if (found == snapshots_.end()) return false;
  found->second.next = 0;
  return Process32Next(snapshot, entry);
}

bool SimulatedProcesses::Process32Next(Handle snapshot, Entry& entry) {
  const auto found = snapshots_.find(snapshot);
  if (found == snapshots_.end() || found->second.next >= found->second.processes.size()) return false;
  const Process& process = found->second.processes[found->second.next++];
  entry.processId = process.id;
  entry.parentProcessId = process.parent;
  // Bytes after the NUL stay from the entry before, as in the system's own record.
  const std::size_t length = std::min(process.name.size(), entry.exeFile.size() - 1);
  std::copy_n(process.name.begin(), length, entry.exeFile.begin());
  entry.exeFile[length] = '\0';
  return true;
}

Handle SimulatedProcesses::OpenProcess(std::uint32_t access, bool, std::uint32_t processId) {
  OpenCalls.push_back({processId, access});
  core_.lastError = 0;
  if (const auto failing = failingOpens_.find(processId); failing != failingOpens_.end()) {
    core_.lastError = kAccessDenied;
    return failing->second;
  }
  const bool known = std::any_of(processes_.begin(), processes_.end(),
                                 [&](const Process& process) { return process.id == processId; });
  if (known && processId != 0) return core_.Open(Core::Kind::Process, processId);
  core_.lastError = kInvalidParameter;
  return kNoHandle;
}

bool SimulatedProcesses::CloseHandle(Handle handle) {
  snapshots_.erase(handle);
  if (handle == kOwnProcess) return true;
  if (core_.opened.erase(handle) == 1) return true;
  ++VainCloses;
  core_.lastError = kErrorInvalidHandle;
  return false;
}

const Process* SimulatedProcesses::Opened(Handle handle) const {
  const Core::Opened* opened = core_.Find(handle, Core::Kind::Process);
  if (!opened) return nullptr;
  const auto found = std::find_if(processes_.begin(), processes_.end(),
                                  [&](const Process& process) { return process.id == opened->number; });
  return found == processes_.end() ? nullptr : &*found;
}

bool SimulatedProcesses::EnumProcessModules(Handle handle, std::span<ModuleHandle> modules) {
  const Process* process = Opened(handle);
  core_.lastError = process && !process->path.empty() ? kNoError : kErrorInvalidHandle;
  if (core_.lastError != 0) return false;
  if (!modules.empty()) modules.front() = kExecutableModule;
  return true;
}

std::uint32_t SimulatedProcesses::GetModuleFileNameExA(Handle handle, ModuleHandle module, std::string& path,
                                                       std::uint32_t size) {
  const Process* process = Opened(handle);
  core_.lastError =
      process && !process->path.empty() && module == kExecutableModule ? kNoError : kErrorInvalidHandle;
  if (core_.lastError != 0) return 0;
  const std::size_t length = std::min({process->path.size(), path.size(), static_cast<std::size_t>(size)});
  path.replace(0, length, process->path, 0, length);
  return static_cast<std::uint32_t>(length);
}

bool SimulatedProcesses::TerminateProcess(Handle handle, std::uint32_t exitCode) {
  const Process* process = Opened(handle);
  TerminateCalls.push_back(std::to_string(process ? process->id : 0) + " " + std::to_string(exitCode));
  core_.lastError = !process                          ? kErrorInvalidHandle
                    : unending_.contains(process->id) ? kAccessDenied
                                                      : kNoError;
  if (core_.lastError != 0) return false;
  End(process->id);
  return true;
}

} // namespace quendra::platform::simulated
