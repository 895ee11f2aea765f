#pragma once

#include "platform/linux/process/ProcFolder.h"
#include "platform/linux/system/Clock.h"
#include "platform/system/System.h"

#include <utility>

namespace quendra::platform::linux_ {

/// Clock, memory and waiting of this system, under the version of the family that has a TCP owner table.
class LinuxSystem : public System {
 public:
  /// The clock that ticks are taken from, in milliseconds, and where the kernel's figures are found.
  explicit LinuxSystem(Clock clock = CoarseMilliseconds, const std::string& procRoot = "/proc");

  /// Counts from the program's start, as on a machine that was up for some hours then. The real uptime would
  /// not do: the program compares ticks as signed numbers, and uses a day number as a tick of long ago. On
  /// some machines it would then find that no second has passed.
  std::uint32_t GetTickCount() override;
  bool GetVersionExA(OsVersion& version) override;
  std::uint32_t FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t language,
                               std::span<char> buffer) override;
  void Sleep(std::uint32_t milliseconds) override;
  /// The processors that were switched on at the program's start.
  void GetSystemInfo(SystemInfo& info) override { info.numberOfProcessors = processors_; }
  void GlobalMemoryStatus(MemoryStatus& status) override;
  bool SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime, std::uint64_t& fileTime) override {
    return FileTimeOf(systemTime, fileTime);
  }
  std::int32_t DayNumber() override;
  std::int32_t SecondOfDay() override;

 private:
  MemoryStatus ReadMemory() const;

  Clock clock_;
  std::uint64_t start_;
  ProcFolder folder_;
  std::uint32_t processors_;
  MemoryStatus memory_;
  std::optional<std::uint64_t> memoryRead_; ///< when
};

} // namespace quendra::platform::linux_
