#pragma once

#include "platform/system/System.h"

namespace quendra::platform::unavailable {

/// A system that tells neither its version nor the time, nor what it is made of. Nobody waits on it.
class UnavailableSystem : public System {
 public:
  std::uint32_t GetTickCount() override { return 0; }
  bool GetVersionExA(OsVersion&) override { return false; }
  std::uint32_t FormatMessageA(std::uint32_t, std::uint32_t, std::uint32_t, std::span<char>) override {
    return 0;
  }
  void Sleep(std::uint32_t) override {}
  void GetSystemInfo(SystemInfo& info) override { info = {}; }
  void GlobalMemoryStatus(MemoryStatus& status) override {
    status = {};
    status.Set(MemoryStatus::kLength, MemoryStatus::kBytes);
    // Whoever shows memory divides by these.
    status.Set(MemoryStatus::kAvailPageFile, 1);
    status.Set(MemoryStatus::kAvailVirtual, 1);
  }
  bool SystemTimeToFileTime(std::span<const std::uint8_t, 16>, std::uint64_t&) override { return false; }
  std::int32_t DayNumber() override { return 0; }
  std::int32_t SecondOfDay() override { return 0; }
};

} // namespace quendra::platform::unavailable
