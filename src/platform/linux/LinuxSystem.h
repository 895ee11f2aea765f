#pragma once

#include "platform/System.h"

namespace quendra::platform::linux_ {

/// Clock and waiting of this system, under the version of the family that has a TCP owner table.
class LinuxSystem : public System {
 public:
  std::uint32_t GetTickCount() override;
  bool GetVersionExA(OsVersion& version) override;
  void Sleep(std::uint32_t milliseconds) override;
  std::int32_t DayNumber() override;
};

} // namespace quendra::platform::linux_
