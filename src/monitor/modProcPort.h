#pragma once

#include "forms/MessageLoop.h"
#include "forms/controls/ListView.h"
#include "monitor/SocketHandleScan.h"
#include "monitor/TcpOwnerEntry.h"
#include "monitor/mdlFileInfo.h"
#include "platform/net/IpHelper.h"
#include "runtime/Integers.h"

#include <vector>

namespace quendra::monitor {

class PortsCells;

/// Which process owns which local TCP port.
class modProcPort {
 public:
  using PortOwner = monitor::PortOwner;

  modProcPort(platform::IpHelper& ipHelper, const SocketHandleScan& handleScan, forms::MessageLoop& loop,
              forms::ListView& main_ListView1, mdlFileInfo& fileInfo);

  /// Brings PortOwnerTable up to date from the handles of all processes. True when the walk has finished.
  bool ScanSocketHandles();
  /// The local port of an own handle, 0 when unknown.
  std::int32_t QueryHandlePort(platform::Handle handle);
  /// Takes the system's table of TCP connections and starts the walk over. On failure the table before stays.
  bool FetchTcpOwnerTable();
  /// Puts every connection's local port into the ports cell of its owner's row. False without a table or
  /// entries. Yields twice an entry.
  bool MergeTcpPorts();
  /// Deletes the connections of foreign processes, up to the first that must stay. False without a table or
  /// entries. Yields twice an entry.
  bool SweepConnections();
  /// The handler of a timer that nothing enables.
  void surf_Timer1_Timer();
  /// Addresses and ports as they lie in memory. Does nothing while ConnectionDeleteEnabled is false.
  void DeleteConnection(std::uint32_t localAddress, std::uint32_t localPort, std::uint32_t remoteAddress,
                        std::uint32_t remotePort);
  /// The four bytes as they lie in memory, dotted, the first byte first.
  static Text IpAddressText(std::uint32_t address);
  /// The module's name of a state number from 1 to 12; empty for any other.
  static Text StateName(std::uint32_t state);

  /// 65536 records by local port; never cleared.
  std::vector<PortOwner> PortOwnerTable;
  Text SystemPortsText;
  Boolean16 ConnectionDeleteEnabled = kFalse16;
  Boolean16 SystemPidsLoaded = kFalse16;

 private:
  bool HasEntries() const { return TcpOwnerSnapshot_ && entryCount_ != 0; }
  void ReadEntry();
  void NextEntry();
  void MergeCurrentEntry(PortsCells& cells);
  bool SweepEndsAtCurrentEntry();

  platform::IpHelper& ipHelper_;
  SocketHandleScan handleScan_;
  forms::MessageLoop& loop_;
  forms::ListView& main_ListView1_;
  mdlFileInfo& fileInfo_;
  platform::IpHelper::TcpTable TcpOwnerSnapshot_;
  std::int32_t entryCount_ = 0;
  // One place for both walks: a walk that starts while another yields moves the other's place too.
  std::int32_t walkOffset_ = 0;
  TcpOwnerEntry currentEntry_;
};

} // namespace quendra::monitor
