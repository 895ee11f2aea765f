#include "platform/linux/system/Clock.h"

#include <ctime>

namespace quendra::platform::linux_ {

std::uint64_t CoarseMilliseconds() {
  timespec now{};
  ::clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
  return static_cast<std::uint64_t>(now.tv_sec) * 1000 + static_cast<std::uint64_t>(now.tv_nsec) / 1'000'000;
}

} // namespace quendra::platform::linux_
