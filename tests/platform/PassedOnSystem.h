#pragma once

#include "platform/system/System.h"

namespace quendra::platform {

/// Passes each question on to another system; a test overrides those that it wants to see or to answer.
class PassedOnSystem : public System {
 public:
  explicit PassedOnSystem(System& system) : system_(system) {}

  std::uint32_t GetTickCount() override { return system_.GetTickCount(); }
  bool GetVersionExA(OsVersion& version) override { return system_.GetVersionExA(version); }
  std::uint32_t FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t language,
                               std::span<char> buffer) override {
    return system_.FormatMessageA(flags, number, language, buffer);
  }
  void Sleep(std::uint32_t milliseconds) override { system_.Sleep(milliseconds); }
  void GetSystemInfo(SystemInfo& info) override { system_.GetSystemInfo(info); }
  void GlobalMemoryStatus(MemoryStatus& status) override { system_.GlobalMemoryStatus(status); }
  bool SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime, std::uint64_t& fileTime) override {
    return system_.SystemTimeToFileTime(systemTime, fileTime);
  }
  std::int32_t DayNumber() override { return system_.DayNumber(); }
  std::int32_t SecondOfDay() override { return system_.SecondOfDay(); }

 private:
  System& system_;
};

} // namespace quendra::platform
