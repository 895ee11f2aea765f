#pragma once

#include "forms/Desktop.h"
#include "forms/ListView.h"
#include "monitor/mdlFileInfo.h"
#include "platform/IpHelper.h"
#include "platform/Machine.h"
#include "runtime/Integers.h"

#include <vector>

namespace quendra::monitor {

/// Which process owns which local TCP port.
class modProcPort {
 public:
  struct PortOwner {
    std::int32_t tcpOwner = 0;
    std::int32_t udpOwner = 0;
  };

  modProcPort(const platform::Machine& machine, forms::Desktop& desktop, forms::ListView& main_ListView1,
              mdlFileInfo& fileInfo);

  bool ScanSocketHandles();
  std::int32_t QueryHandlePort(std::uint32_t handle);
  bool FetchTcpOwnerTable();
  bool MergeTcpPorts();
  bool SweepConnections();
  void DeleteConnection(std::uint32_t localAddress, std::uint32_t localPort, std::uint32_t remoteAddress,
                        std::uint32_t remotePort);
  static Text IpAddressText(std::uint32_t address);
  /// The module's name of a state number from 1 to 12; empty for any other.
  static Text StateName(std::uint32_t state);

  /// 65536 records by local port; never cleared.
  std::vector<PortOwner> PortOwnerTable;
  Text SystemPortsText;
  Boolean16 ConnectionDeleteEnabled = kFalse16;
  Boolean16 SystemPidsLoaded = kFalse16;

 private:
  platform::Machine machine_;
  forms::Desktop& desktop_;
  forms::ListView& main_ListView1_;
  mdlFileInfo& fileInfo_;
  platform::IpHelper::TcpTable TcpOwnerSnapshot_;
  std::int32_t entryCount_ = 0;
  std::int32_t walkOffset_ = 0;
};

} // namespace quendra::monitor
