#include "monitor/SystemVersion.h"

#include "monitor/OsVersionCode.h"

namespace quendra::monitor {

void SystemVersion::Read() {
  OsVersionCode = 0;
  platform::OsVersion version;
  if (system_.GetVersionExA(version)) {
    OsVersionCode = OsVersionCodeOf(version);
    return;
  }
  loop_.MessageBox(
      u"An error occured while trying to get the OS version and information.\r\nClick OK to continue.",
      forms::kExclamation, u"  Error Getting OS Information");
}

} // namespace quendra::monitor
