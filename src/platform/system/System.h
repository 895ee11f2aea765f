#pragma once

#include "platform/system/MemoryStatus.h"
#include "platform/system/SystemTime.h"

#include <cstdint>
#include <span>

namespace quendra::platform {

struct OsVersion {
  std::uint32_t platformId = 0;
  std::uint32_t majorVersion = 0;
  std::uint32_t minorVersion = 0;
  std::uint32_t buildNumber = 0;
};

/// What GetSystemInfo tells, as far as the program asks.
struct SystemInfo {
  std::uint32_t numberOfProcessors = 0;
};

/// Clock, version, memory and waiting.
class System {
 public:
  virtual ~System() = default;

  /// Milliseconds, wrapping after 49.7 days.
  virtual std::uint32_t GetTickCount() = 0;
  /// False on failure.
  virtual bool GetVersionExA(OsVersion& version) = 0;
  /// What FormatMessageA takes its texts from: the system.
  static constexpr std::uint32_t kFromSystem = 4096;
  /// The system's text for one of its error numbers, with its NUL, in the code page. Its length without the
  /// NUL, 0 on failure.
  virtual std::uint32_t FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t language,
                                       std::span<char> buffer) = 0;
  /// Blocks the thread.
  virtual void Sleep(std::uint32_t milliseconds) = 0;
  virtual void GetSystemInfo(SystemInfo& info) = 0;
  /// Fills the image, whose length field holds its size.
  virtual void GlobalMemoryStatus(MemoryStatus& status) = 0;
  /// False on failure. Hundreds of nanoseconds since the start of 1601.
  virtual bool SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime,
                                    std::uint64_t& fileTime) = 0;
  /// The current local date as the language numbers days: 1 is 31 December 1899.
  virtual std::int32_t DayNumber() = 0;
  /// The current local time: seconds since midnight.
  virtual std::int32_t SecondOfDay() = 0;
};

} // namespace quendra::platform
