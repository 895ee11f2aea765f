#pragma once

#include "platform/simulated/SimulatedCore.h"
#include "platform/system/System.h"

#include <algorithm>

namespace quendra::platform::simulated {

/// A clock that moves when the test says so, and by what is slept.
class SimulatedSystem : public System {
 public:
  explicit SimulatedSystem(Core& core) : core_(core) {}

  void SetTick(std::uint32_t tick) { core_.tickCount = tick; }
  void AdvanceTick(std::uint32_t milliseconds) { core_.tickCount += milliseconds; }
  /// Family 2, version 5.1 unless set.
  OsVersion Version{2, 5, 1, 2600};
  bool FailVersion = false;
  std::uint32_t ProcessorCount = 1;
  /// Half a gigabyte, half of it free, unless set.
  MemoryStatus Memory =
      MemoryOf({50, 0x20000000, 0x10000000, 0x40000000, 0x30000000, 0x7FFE0000, 0x7F000000});
  int MemoryQuestions = 0;
  /// The system's texts by error number; no other has one.
  std::map<std::uint32_t, std::string> MessageTexts{{5, "Access is denied.\r\n"}};
  std::int32_t Day = 38353;        ///< 1 January 2005
  std::int32_t Second = 12 * 3600; ///< of the day

  std::uint32_t GetTickCount() override { return core_.tickCount; }
  bool GetVersionExA(OsVersion& version) override {
    if (!FailVersion) version = Version;
    return !FailVersion;
  }
  std::uint32_t FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t,
                               std::span<char> buffer) override {
    const auto found = MessageTexts.find(number);
    if (flags != kFromSystem || found == MessageTexts.end() || buffer.empty()) return 0;
    const std::string text = found->second.substr(0, buffer.size() - 1);
    std::ranges::copy(text, buffer.begin());
    buffer[text.size()] = '\0';
    return static_cast<std::uint32_t>(text.size());
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
