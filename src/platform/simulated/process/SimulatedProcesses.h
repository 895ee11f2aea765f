#pragma once

#include "platform/process/Processes.h"
#include "platform/simulated/SimulatedCore.h"

#include <set>

namespace quendra::platform::simulated {

/// Texts are bytes of the system's code page. A process without a path has no modules.
struct Process {
  std::uint32_t id = 0;
  std::uint32_t parent = 0;
  std::string name{};
  std::string path{};
};

class SimulatedProcesses : public Processes {
 public:
  explicit SimulatedProcesses(Core& core) : core_(core) {}

  // The script. A snapshot lists the processes in the order in which they were added.
  void Add(Process process) { processes_.push_back(std::move(process)); }
  void End(std::uint32_t id);
  bool FailSnapshots = false;
  /// OpenProcess of this id gives `answer` instead of a handle.
  void FailOpen(std::uint32_t id, Handle answer = kNoHandle) { failingOpens_[id] = answer; }
  /// The error that an earlier call left.
  void LeaveError(std::uint32_t error) { core_.lastError = error; }

  /// TerminateProcess of this id is refused.
  void RefuseToEnd(std::uint32_t id) { unending_.insert(id); }
  /// One text a call: id (0 for a handle of nothing) and exit code, as in "100 0".
  std::vector<std::string> TerminateCalls;

  /// Handles of any kind that were given and not closed.
  int OpenHandles() const { return static_cast<int>(core_.opened.size()); }
  /// CloseHandle calls for something that was no open handle.
  int VainCloses = 0;
  int SnapshotsTaken = 0;
  /// The ids that OpenProcess was asked for, with the access.
  struct OpenCall {
    std::uint32_t id = 0;
    std::uint32_t access = 0;
  };
  std::vector<OpenCall> OpenCalls;

  Handle CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t processId) override;
  bool Process32First(Handle snapshot, Entry& entry) override;
  bool Process32Next(Handle snapshot, Entry& entry) override;
  Handle OpenProcess(std::uint32_t access, bool inherit, std::uint32_t processId) override;
  Handle GetCurrentProcess() override { return kOwnProcess; }
  bool CloseHandle(Handle handle) override;
  bool EnumProcessModules(Handle process, std::span<ModuleHandle> modules) override;
  std::uint32_t GetModuleFileNameExA(Handle process, ModuleHandle module, std::string& path,
                                     std::uint32_t size) override;
  bool TerminateProcess(Handle process, std::uint32_t exitCode) override;
  std::uint32_t GetLastError() override { return core_.lastError; }

 private:
  struct Snapshot {
    std::vector<Process> processes;
    std::size_t next = 0;
  };
  const Process* Opened(Handle process) const;

  Core& core_;
  std::vector<Process> processes_;
  std::map<std::uint32_t, Handle> failingOpens_;
  std::set<std::uint32_t> unending_;
  std::map<Handle, Snapshot> snapshots_;
};

} // namespace quendra::platform::simulated
