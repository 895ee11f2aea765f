#pragma once

#include "platform/system/System.h"

namespace quendra::platform::windows {

/// A version that the program knows: it asks for the TCP owner table of XP by that system's number alone.
/// Later systems have that table too, and what else the program takes from XP, so they count as XP.
OsVersion AsKnown(const OsVersion& told);

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
