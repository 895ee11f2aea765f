#pragma once

#include "platform/system/System.h"

namespace quendra::platform::unavailable {

/// A system that tells neither its version nor the time. Nobody waits on it.
class UnavailableSystem : public System {
 public:
  std::uint32_t GetTickCount() override { return 0; }
  bool GetVersionExA(OsVersion&) override { return false; }
  void Sleep(std::uint32_t) override {}
  std::int32_t DayNumber() override { return 0; }
  std::int32_t SecondOfDay() override { return 0; }
};

} // namespace quendra::platform::unavailable
