#pragma once

#include "monitor/PortSource.h"
#include "monitor/ProcessRowAdder.h"
#include "monitor/Rates.h"
#include "monitor/TableControls.h"
#include "platform/process/Processes.h"
#include "platform/system/System.h"

namespace quendra::monitor {

/// The process table: main_ListView1, the one routine that brings it up to date and the tick of the last time
/// that it did.
class ProcessTable {
 public:
  ProcessTable(platform::Processes& processes, platform::System& system, TableControls& controls,
               ProcessRowAdder& adder, PortSource& ports);

  /// One pass over a process snapshot. The reason is ignored. The caller decides whether the tick is stored
  /// after it.
  void RefreshProcessTable(const Text& reason);
  /// Makes a pass and stores the tick when a second has gone since the last one and the page is open.
  void RefreshWhenDue();
  void StampLastRefresh();
  /// A day number lies far below any tick, so that the first packet finds a second over and refreshes at
  /// once.
  void SeedLastRefresh();

  /// The table half of the page's start: clears the rows, sets up the columns and clears SortPinned. Seeding
  /// LastRefreshTick and the first pass follow, by the caller.
  void PrepareTable();
  /// Sorts by the clicked column, `header` from 1; a second click on it turns the order over.
  void main_ListView1_ColumnClick(int header);

  bool PageIsOpen() const { return controls_.frameMain.Visible(); }
  forms::ListView& List() { return controls_.main_ListView1; }

  std::int32_t LastRefreshTick = 0; ///< milliseconds; set by whoever calls the pass, never by the pass itself
  /// Nothing sets it.
  Boolean16 SortPinned = kFalse16;

 private:
  /// Milliseconds, modulo 2^32 and without a sign: with one, a page opened when the system has been up for 25
  /// days or more would never refresh, as the day number that seeds the tick would lie ahead.
  std::uint32_t SinceLastRefresh() const;
  void ClearMarks();
  /// Updates and adds rows; closes the snapshot. The sums of the rates of the rows that were there before.
  TrafficSums WalkSnapshot(platform::Handle snapshot, double seconds);
  void RemoveUnmarkedRows();

  platform::Processes& processes_;
  platform::System& system_;
  TableControls& controls_;
  ProcessRowAdder& adder_;
  PortSource& ports_;
};

} // namespace quendra::monitor
