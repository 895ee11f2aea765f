#include "platform/linux/process/LinuxProcesses.h"

#include <signal.h>
#include <sys/syscall.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

constexpr ModuleHandle kExecutableModule{1};

} // namespace

LinuxProcesses::LinuxProcesses(const ProcFolder& folder, HandleTable& handles, SystemPaths& paths,
                               Clock clock)
    : folder_(folder), handles_(handles), paths_(paths), list_(folder, std::move(clock)) {}

bool LinuxProcesses::Fail(std::uint32_t error) {
  handles_.lastError = error;
  return false;
}

bool LinuxProcesses::Succeed() {
  handles_.lastError = kNoError;
  return true;
}

Handle LinuxProcesses::CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t) {
  Snapshot snapshot;
  if ((flags & kSnapProcess) == 0) {
    Fail(kInvalidParameter);
    return kInvalidHandle;
  }
  if (!list_.Read(snapshot.rows)) {
    Fail(kAccessDenied);
    return kInvalidHandle;
  }
  Succeed();
  return handles_.Add(std::move(snapshot));
}

bool LinuxProcesses::Process32First(Handle handle, Entry& entry) {
  Snapshot* snapshot = handles_.Find<Snapshot>(handle);
  if (snapshot != nullptr) snapshot->next = 0;
  return NextOf(snapshot, entry);
}

bool LinuxProcesses::Process32Next(Handle handle, Entry& entry) {
  return NextOf(handles_.Find<Snapshot>(handle), entry);
}

bool LinuxProcesses::NextOf(Snapshot* snapshot, Entry& entry) {
  if (snapshot == nullptr) return Fail(kErrorInvalidHandle);
  if (snapshot->next >= snapshot->rows.size()) return Fail(kNoMoreFiles);
  const ProcessList::Row& row = snapshot->rows[snapshot->next++];
  entry.processId = row.processId;
  entry.parentProcessId = row.parentProcessId;
  entry.exeFile.fill('\0');
  std::copy_n(row.name.begin(), std::min(row.name.size(), ProcessList::kNameLength), entry.exeFile.begin());
  return Succeed();
}

Handle LinuxProcesses::OpenProcess(std::uint32_t access, bool, std::uint32_t processId) {
  Descriptor folder = processId == 0 ? Descriptor() : folder_.Open(processId);
  if (!folder) {
    Fail(kInvalidParameter);
    return kNoHandle;
  }
  Descriptor process;
  if ((access & kTerminate) != 0) {
    process = OpenToEnd(processId, folder);
    if (!process) return kNoHandle;
  }
  Succeed();
  return handles_.Add(OpenedProcess{std::move(folder), std::move(process)});
}

Descriptor LinuxProcesses::OpenToEnd(std::uint32_t processId, const Descriptor& folder) {
  Descriptor process(static_cast<int>(::syscall(SYS_pidfd_open, processId, 0)));
  // Asked of the folder after that: as it still answers, the id has had one process all the time.
  const auto stat = ProcFolder::Stat(folder);
  const auto shown = list_.StartTimeOf(processId);
  if (!stat || (shown && *shown != stat->startTime)) {
    Fail(kInvalidParameter);
    return {};
  }
  // The kernel and its first process would take the signal and go on.
  if (!process || processId == kFirstProcess || stat->isKernelThread) {
    Fail(kAccessDenied);
    return {};
  }
  return process;
}

bool LinuxProcesses::TerminateProcess(Handle handle, std::uint32_t) {
  const OpenedProcess* opened = handles_.Find<OpenedProcess>(handle);
  if (opened == nullptr) return Fail(kErrorInvalidHandle);
  const bool ended =
      opened->process && ::syscall(SYS_pidfd_send_signal, opened->process.Number(), SIGKILL, nullptr, 0) == 0;
  return ended ? Succeed() : Fail(kAccessDenied);
}

Handle LinuxProcesses::GetCurrentProcess() {
  Succeed();
  return kOwnProcess;
}

bool LinuxProcesses::CloseHandle(Handle handle) {
  return handle == kOwnProcess || handles_.Close(handle) ? Succeed() : Fail(kErrorInvalidHandle);
}

std::optional<std::string> LinuxProcesses::ExecutableOf(Handle process) {
  if (process == kOwnProcess) return folder_.Executable(static_cast<std::uint32_t>(::getpid()));
  OpenedProcess* opened = handles_.Find<OpenedProcess>(process);
  if (opened == nullptr) {
    Fail(kErrorInvalidHandle);
    return {};
  }
  auto executable = ProcFolder::Executable(opened->folder);
  // A process with folders of its own runs another file than the one that has this path here, and would pass
  // for it.
  if (!executable || !executable->isHere) {
    Fail(kPartialCopy);
    return {};
  }
  return std::move(executable->path);
}

bool LinuxProcesses::EnumProcessModules(Handle process, std::span<ModuleHandle> modules) {
  if (!ExecutableOf(process)) return false;
  if (!modules.empty()) modules[0] = kExecutableModule;
  return Succeed();
}

std::uint32_t LinuxProcesses::GetModuleFileNameExA(Handle process, ModuleHandle module, std::string& path,
                                                   std::uint32_t size) {
  const auto executable = ExecutableOf(process);
  if (!executable) return 0;
  if (module != kExecutableModule && module != ModuleHandle()) {
    Fail(kModuleNotFound);
    return 0;
  }
  const std::string name = paths_.ToSystem(*executable, std::min<std::size_t>(size, path.size()));
  std::copy(name.begin(), name.end(), path.begin());
  Succeed();
  return static_cast<std::uint32_t>(name.size());
}

} // namespace quendra::platform::linux_
