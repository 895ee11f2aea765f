#include "monitor/PortSource.h"

namespace quendra::monitor {

namespace {

constexpr std::int32_t kSocketHandleVersion = 2000;
constexpr std::int32_t kTcpOwnerVersion = 2002;

} // namespace

PortsByOwner PortSource::OfNewRows() {
  return version_.OsVersionCode == kSocketHandleVersion ? OfAllHandles() : PortsByOwner();
}

void PortSource::MergeIntoRows() {
  if (version_.OsVersionCode != kTcpOwnerVersion) return;
  // Without a new table the one before is walked again.
  procPort_.FetchTcpOwnerTable();
  procPort_.MergeTcpPorts();
}

void PortSource::EnableDebugging() {
  if (!SeDebugEnabled)
    SeDebugEnabled = fileInfo_.EnablePrivilege(u"SeDebugPrivilege", platform::Tokens::kEnabled);
}

PortsByOwner PortSource::OfAllHandles() {
  EnableDebugging();
  PortsByOwner ports;
  const bool scanned = procPort_.ScanSocketHandles();
  if (!scanned || !SeDebugEnabled) return ports;
  for (std::uint32_t port = 0; port < procPort_.PortOwnerTable.size(); ++port)
    if (const std::int32_t owner = procPort_.PortOwnerTable[port].tcpOwner)
      ports.Add(static_cast<std::uint32_t>(owner), port);
  return ports;
}

} // namespace quendra::monitor
