#pragma once

#include "monitor/MonitorPage.h"
#include "monitor/mdlFileInfo.h"
#include "monitor/modProcPort.h"

namespace quendra::monitor {

/// The process table: main_ListView1 and the one routine that brings it up to date.
class ProcessTable {
 public:
  ProcessTable(const platform::Machine& machine, forms::Desktop& desktop, MonitorPage page, MonitorFields& fields,
               mdlFileInfo& fileInfo, modProcPort& procPort);

  /// One pass over a process snapshot. The reason is ignored.
  void RefreshProcessTable(const Text& reason);

  /// The table half of the page's start: clears the rows, sets up the columns and clears SortPinned. Seeding
  /// LastRefreshTick and the first pass follow, by the caller.
  void PrepareTable();
  void main_ListView1_ColumnClick(int header);

  Boolean16 SeDebugEnabled = kFalse16;
  Boolean16 SortPinned = kFalse16;

 private:
  platform::Machine machine_;
  forms::Desktop& desktop_;
  MonitorPage page_;
  MonitorFields& fields_;
  mdlFileInfo& fileInfo_;
  modProcPort& procPort_;
};

} // namespace quendra::monitor
