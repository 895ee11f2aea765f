#pragma once

#include "platform/process/Icons.h"
#include "platform/process/Tokens.h"
#include "platform/process/VersionInfo.h"
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
  std::map<Handle, Snapshot> snapshots_;
};

/// Each step succeeds while its error is 0. AdjustTokenPrivileges answers true with error 1300, as for an
/// account that lacks the privilege, and false with any other.
class SimulatedTokens : public Tokens {
 public:
  explicit SimulatedTokens(Core& core) : core_(core) {}

  std::uint32_t OpenProcessTokenError = 0;
  std::uint32_t LookupPrivilegeValueError = 0;
  std::uint32_t AdjustTokenPrivilegesError = 0;
  /// "SeDebugPrivilege 2" for each AdjustTokenPrivileges that got through.
  std::vector<std::string> Adjusted;

  bool OpenProcessToken(Handle process, std::uint32_t access, Handle& token) override;
  bool LookupPrivilegeValueA(const std::string& system, const std::string& name,
                             std::uint64_t& luid) override;
  bool AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid, std::uint32_t attributes,
                             std::span<std::uint8_t, 16> previousState) override;

 private:
  bool Answer(std::uint32_t error);

  Core& core_;
  std::vector<std::string> privileges_;
};

class SimulatedVersionInfo : public VersionInfo {
 public:
  /// A version block: the bytes of its translation value (language, then code page, low bytes first) and its
  /// texts under the table that the translation names; bytes that the value lacks count as 0. A block without
  /// a translation value takes no bytes.
  void Add(const std::string& path, std::vector<std::uint8_t> translation,
           std::map<std::string, std::string> texts);
  /// GetFileVersionInfoA fails for this path, though it has a size.
  void FailReading(const std::string& path) { unreadable_.insert(path); }
  /// The sub-blocks that were asked for, in order.
  std::vector<std::string> Queries;

  std::uint32_t GetFileVersionInfoSizeA(const std::string& path) override;
  bool GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) override;
  std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t> block,
                                                          const std::string& subBlock) override;

 private:
  struct Block {
    std::vector<std::uint8_t> translation;
    std::string table;
    std::map<std::string, std::string> texts;
  };
  std::vector<Block> blocks_;
  std::map<std::string, std::uint32_t> indexOf_;
  std::set<std::string> unreadable_;
};

class SimulatedIcons : public Icons {
 public:
  /// The image of the file's first icon.
  void Set(const std::string& path, std::vector<std::uint8_t> image) { images_[path] = std::move(image); }
  int Extracted = 0;
  int Destroyed = 0;
  /// Extracted and not destroyed.
  int Live() const { return static_cast<int>(live_.size()); }

  Handle ExtractIconExA(const std::string& path, int index) override;
  const std::vector<std::uint8_t>& ImageOf(Handle icon) override;
  bool DestroyIcon(Handle icon) override;

 private:
  std::map<std::string, std::vector<std::uint8_t>> images_;
  std::map<Handle, std::vector<std::uint8_t>> live_;
};

} // namespace quendra::platform::simulated
