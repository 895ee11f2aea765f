#include "foundation/OsVersion.h"

namespace quendra::foundation {

namespace {

constexpr std::uint32_t kAny = 0xFFFFFFFF;
constexpr std::uint32_t kLastKnownPlatform = 2;

struct Known {
  std::uint32_t platformId;
  std::uint32_t majorVersion;
  std::uint32_t minorVersion;
  const char16_t* name;
  std::int32_t code;
};

constexpr Known kKnown[] = {
    {0, kAny, kAny, u"Win 32", 32},      {1, kAny, 0, u"Windows 95", 95},
    {1, kAny, 10, u"Windows 98", 98},    {2, 3, kAny, u"Windows NT 3.51", 351},
    {2, 4, kAny, u"Windows NT 4.0", 40}, {2, 5, 0, u"Windows 2000", 2000},
    {2, 5, 1, u"Windows XP", 2002},
};

bool Matches(std::uint32_t pattern, std::uint32_t value) { return pattern == kAny || pattern == value; }

} // namespace

void Describe(const platform::OsVersion& told, OsVersion& version) {
  version.version = DecimalText(told.majorVersion) + u"." + DecimalText(told.minorVersion);
  version.build = DecimalText(told.buildNumber);
  if (told.platformId > kLastKnownPlatform) {
    version.name = u"Unknown";
    version.code = 0;
  }
  for (const Known& known : kKnown) {
    if (known.platformId != told.platformId || !Matches(known.majorVersion, told.majorVersion) ||
        !Matches(known.minorVersion, told.minorVersion))
      continue;
    version.name = known.name;
    version.code = known.code;
    return;
  }
}

bool ReadOsVersion(platform::System& system, forms::MessageLoop& loop, OsVersion& version) {
  platform::OsVersion told;
  if (system.GetVersionExA(told)) {
    Describe(told, version);
    return true;
  }
  loop.MessageBox(
      u"An error occured while trying to get the OS version and information.\rClick OK to continue.",
      forms::kExclamation, u"  Error Getting OS Information");
  return false;
}

} // namespace quendra::foundation
