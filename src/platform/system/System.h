#pragma once

#include <cstdint>

namespace quendra::platform {

struct OsVersion {
  std::uint32_t platformId = 0;
  std::uint32_t majorVersion = 0;
  std::uint32_t minorVersion = 0;
};

/// Clock, version and waiting.
class System {
 public:
  virtual ~System() = default;

  /// Milliseconds, wrapping after 49.7 days.
  virtual std::uint32_t GetTickCount() = 0;
  /// False on failure.
  virtual bool GetVersionExA(OsVersion& version) = 0;
  /// Blocks the thread.
  virtual void Sleep(std::uint32_t milliseconds) = 0;
  /// The current local date as the language numbers days: 1 is 31 December 1899.
  virtual std::int32_t DayNumber() = 0;
  /// The current local time: seconds since midnight.
  virtual std::int32_t SecondOfDay() = 0;
};

} // namespace quendra::platform
