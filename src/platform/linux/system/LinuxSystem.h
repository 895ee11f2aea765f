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

  /// Counts from the program's start, as on a machine that was up for some hours then. The real uptime would
  /// not do: the program compares ticks as signed numbers, and uses a day number as a tick of long ago. On
  /// some machines it would then find that no second has passed.
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
