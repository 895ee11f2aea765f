#pragma once

#include "monitor/MonitorPage.h"
#include "monitor/PortsByOwner.h"
#include "monitor/Rates.h"
#include "monitor/mdlFileInfo.h"
#include "monitor/modProcPort.h"

namespace quendra::monitor {

/// The process table: main_ListView1 and the one routine that brings it up to date.
class ProcessTable {
 public:
  ProcessTable(const platform::Machine& machine, forms::Desktop& desktop, MonitorPage page,
               MonitorFields& fields, mdlFileInfo& fileInfo, modProcPort& procPort);

  /// One pass over a process snapshot. The reason is ignored.
  void RefreshProcessTable(const Text& reason);

  /// The table half of the page's start: clears the rows, sets up the columns and clears SortPinned. Seeding
  /// LastRefreshTick and the first pass follow, by the caller.
  void PrepareTable();
  /// Sorts by the clicked column, `header` from 1; a second click on it turns the order over.
  void main_ListView1_ColumnClick(int header);

  Boolean16 SeDebugEnabled = kFalse16;
  /// Nothing sets it.
  Boolean16 SortPinned = kFalse16;

 private:
  double SecondsSinceLastRefresh() const;
  void ClearMarks();
  /// Updates and adds rows; closes the snapshot. The sums of the rates of the rows that were there before.
  TrafficSums WalkSnapshot(platform::Handle snapshot, double seconds);
  PortsByOwner PortsOfAllProcesses();
  void RemoveUnmarkedRows();

  platform::Machine machine_;
  forms::Desktop& desktop_;
  MonitorPage page_;
  MonitorFields& fields_;
  mdlFileInfo& fileInfo_;
  modProcPort& procPort_;
};

} // namespace quendra::monitor
