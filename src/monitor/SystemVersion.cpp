#include "monitor/SystemVersion.h"

#include "foundation/OsVersion.h"

namespace quendra::monitor {

void SystemVersion::Read() {
  foundation::OsVersion version;
  foundation::ReadOsVersion(system_, loop_, version);
  OsVersionCode = version.code;
}

} // namespace quendra::monitor
