#pragma once

#include "platform/system/System.h"

namespace quendra::platform::windows {

/// The system's clock, version, memory and waiting.
class WindowsSystem : public System {
 public:
  std::uint32_t GetTickCount() override;
  bool GetVersionExA(OsVersion& version) override;
  std::uint32_t FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t language,
                               std::span<char> buffer) override;
  void Sleep(std::uint32_t milliseconds) override;
  void GetSystemInfo(SystemInfo& info) override;
  void GlobalMemoryStatus(MemoryStatus& status) override;
  bool SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime, std::uint64_t& fileTime) override;
  std::int32_t DayNumber() override;
  std::int32_t SecondOfDay() override;
};

} // namespace quendra::platform::windows
