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
  std::int32_t DayNumber() override { return Day; }
  std::int32_t SecondOfDay() override { return Second; }

 private:
  Core& core_;
};

} // namespace quendra::platform::simulated
