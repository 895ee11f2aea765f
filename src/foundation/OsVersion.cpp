#include "monitor/OsVersionCode.h"

namespace quendra::monitor {

namespace {

constexpr std::uint32_t kAny = 0xFFFFFFFF;

struct Known {
  std::uint32_t platformId;
  std::uint32_t majorVersion;
  std::uint32_t minorVersion;
  std::int32_t code;
};

constexpr Known kKnown[] = {
    {0, kAny, kAny, 32}, {1, kAny, 0, 95}, {1, kAny, 10, 98}, {2, 3, kAny, 351},
    {2, 4, kAny, 40},    {2, 5, 0, 2000},  {2, 5, 1, 2002},
};

bool Matches(std::uint32_t pattern, std::uint32_t value) { return pattern == kAny || pattern == value; }

} // namespace

std::int32_t OsVersionCodeOf(const platform::OsVersion& version) {
  for (const Known& known : kKnown)
    if (known.platformId == version.platformId && Matches(known.majorVersion, version.majorVersion) &&
        Matches(known.minorVersion, version.minorVersion))
      return known.code;
  return 0;
}

} // namespace quendra::monitor
