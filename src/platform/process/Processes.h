#pragma once

#include "runtime/OpaqueHandle.h"

#include <array>
#include <cstdint>
#include <span>
#include <string>

namespace quendra::platform {

/// An opaque 32-bit handle of the system.
using Handle = OpaqueHandle<struct ObjectKind>;
inline constexpr Handle kNoHandle;
inline constexpr Handle kInvalidHandle{0xFFFFFFFF};
/// Stands for the own process wherever a process's handle is asked for: the invalid handle's value.
inline constexpr Handle kOwnProcess = kInvalidHandle;
/// The room that the system's file names and paths may take, with their NUL.
inline constexpr std::size_t kPathRoom = 260;

/// A module of a process.
using ModuleHandle = OpaqueHandle<struct ModuleKind>;

/// The process list and opened processes, with the system's last error.
class Processes {
 public:
  virtual ~Processes() = default;

  /// One process of a snapshot. `exeFile` is the executable's file name in the system's code page, ended by a
  /// NUL.
  struct Entry {
    std::uint32_t processId = 0;
    std::uint32_t parentProcessId = 0;
    std::array<char, kPathRoom> exeFile{};
  };

  static constexpr std::uint32_t kSnapProcess = 2;
  /// The access of OpenProcess that TerminateProcess needs.
  static constexpr std::uint32_t kTerminate = 1;

  /// A snapshot's handle, kInvalidHandle on failure. CloseHandle frees it.
  virtual Handle CreateToolhelp32Snapshot(std::uint32_t flags, std::uint32_t processId) = 0;
  /// False when the snapshot has no such entry, or the handle is none.
  virtual bool Process32First(Handle snapshot, Entry& entry) = 0;
  virtual bool Process32Next(Handle snapshot, Entry& entry) = 0;

  /// kNoHandle on failure.
  virtual Handle OpenProcess(std::uint32_t access, bool inherit, std::uint32_t processId) = 0;
  virtual Handle GetCurrentProcess() = 0;
  virtual bool CloseHandle(Handle handle) = 0;

  /// Fills `modules` with the handles of the process's modules, the executable first; false on failure.
  virtual bool EnumProcessModules(Handle process, std::span<ModuleHandle> modules) = 0;
  /// Writes the module's path in the system's code page over the start of `path`, at most `size` characters
  /// and never beyond the text's end; gives the number written, 0 on failure.
  virtual std::uint32_t GetModuleFileNameExA(Handle process, ModuleHandle module, std::string& path,
                                             std::uint32_t size) = 0;

  /// Ends an opened process; false on failure.
  virtual bool TerminateProcess(Handle process, std::uint32_t exitCode) = 0;

  /// 0 when the last call that sets it left no error.
  virtual std::uint32_t GetLastError() = 0;
};

} // namespace quendra::platform
