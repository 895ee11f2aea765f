#pragma once

#include "platform/linux/system/Clock.h"
#include "platform/system/System.h"

#include <utility>

namespace quendra::platform::linux_ {

/// Clock and waiting of this system, under the version of the family that has a TCP owner table.
class LinuxSystem : public System {
 public:
  /// The clock that ticks are taken from, in milliseconds.
  explicit LinuxSystem(Clock clock = CoarseMilliseconds) : clock_(std::move(clock)), start_(clock_()) {}

  /// Counts from the program's start, as on a machine that was up for some hours then. Uptime itself would
  /// say at the wrong times that no second has passed: the program takes a day number for a tick long gone,
  /// and differences of ticks as signed numbers.
  std::uint32_t GetTickCount() override;
  bool GetVersionExA(OsVersion& version) override;
  void Sleep(std::uint32_t milliseconds) override;
  std::int32_t DayNumber() override;
  std::int32_t SecondOfDay() override;

 private:
  Clock clock_;
  std::uint64_t start_;
};

} // namespace quendra::platform::linux_
