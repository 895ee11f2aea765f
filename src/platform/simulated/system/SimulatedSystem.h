#pragma once

#include "platform/simulated/SimulatedCore.h"
#include "platform/system/System.h"

namespace quendra::platform::simulated {

/// A clock that moves when the test says so, and by what is slept.
class SimulatedSystem : public System {
 public:
  explicit SimulatedSystem(Core& core) : core_(core) {}

  void SetTick(std::uint32_t tick) { core_.tickCount = tick; }
  void AdvanceTick(std::uint32_t milliseconds) { core_.tickCount += milliseconds; }
  /// Family 2, version 5.1 unless set.
  OsVersion Version{2, 5, 1};
  bool FailVersion = false;
  std::uint32_t ProcessorCount = 1;
  /// Half a gigabyte, half of it free, unless set.
  MemoryStatus Memory =
      MemoryOf({50, 0x20000000, 0x10000000, 0x40000000, 0x30000000, 0x7FFE0000, 0x7F000000});
  int MemoryQuestions = 0;
  std::int32_t Day = 38353;        ///< 1 January 2005
  std::int32_t Second = 12 * 3600; ///< of the day

  std::uint32_t GetTickCount() override { return core_.tickCount; }
  bool GetVersionExA(OsVersion& version) override {
    if (!FailVersion) version = Version;
    return !FailVersion;
  }
  void Sleep(std::uint32_t milliseconds) override {
    core_.calls.push_back("Sleep " + std::to_string(milliseconds));
    core_.tickCount += milliseconds;
  }
  void GetSystemInfo(SystemInfo& info) override { info.numberOfProcessors = ProcessorCount; }
  void GlobalMemoryStatus(MemoryStatus& status) override {
    ++MemoryQuestions;
    status = Memory;
  }
  bool SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime, std::uint64_t& fileTime) override {
    return FileTimeOf(systemTime, fileTime);
  }
  std::int32_t DayNumber() override { return Day; }
  std::int32_t SecondOfDay() override { return Second; }

  /// The load in per cent, then total and available bytes: physical, page file, virtual.
  static MemoryStatus MemoryOf(const std::array<std::uint32_t, 7>& figures) {
    MemoryStatus status;
    status.Set(MemoryStatus::kLength, MemoryStatus::kBytes);
    std::size_t at = MemoryStatus::kMemoryLoad;
    for (const std::uint32_t figure : figures) {
      PutLittle32(status.bytes, at, figure);
      at += sizeof figure;
    }
    return status;
  }

 private:
  Core& core_;
};

} // namespace quendra::platform::simulated
