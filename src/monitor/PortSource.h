#pragma once

#include "monitor/PortsByOwner.h"
#include "monitor/SystemVersion.h"
#include "monitor/modProcPort.h"

namespace quendra::monitor {

/// Where the ports of the table's rows come from. The version of the system decides: from the handles of all
/// processes on version 2000, from the table of connections on version 2002, from nowhere on any other.
class PortSource {
 public:
  PortSource(const SystemVersion& version, mdlFileInfo& fileInfo, modProcPort& procPort)
      : version_(version), fileInfo_(fileInfo), procPort_(procPort) {}

  /// What the rows take that a pass adds.
  PortsByOwner OfNewRows();
  /// Adds the ports of connections to the rows that stand, at the end of a pass.
  void MergeIntoRows();

  /// Asks for the right to look at and end processes of others, unless it was got before.
  void EnableDebugging();

  Boolean16 SeDebugEnabled = kFalse16;

 private:
  PortsByOwner OfAllHandles();

  const SystemVersion& version_;
  mdlFileInfo& fileInfo_;
  modProcPort& procPort_;
};

} // namespace quendra::monitor
