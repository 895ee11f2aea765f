#include "monitor/ProcessTable.h"

#include "monitor/OwnedHandle.h"
#include "monitor/ProcessRow.h"

namespace quendra::monitor {

namespace {

constexpr std::uint32_t kRefreshInterval = 1000;

} // namespace

ProcessTable::ProcessTable(platform::Processes& processes, platform::System& system, TableControls& controls,
                           ProcessRowAdder& adder, PortSource& ports)
    : processes_(processes), system_(system), controls_(controls), adder_(adder), ports_(ports) {
  controls_.main_ListView1.ColumnClick = [this](int header) { main_ListView1_ColumnClick(header); };
}

void ProcessTable::RefreshProcessTable(const Text&) {
  const double seconds = SinceLastRefresh() / 1000.0;
  ClearMarks();
  const platform::Handle snapshot = processes_.CreateToolhelp32Snapshot(platform::Processes::kSnapProcess, 0);
  if (snapshot == platform::kInvalidHandle) return;
  const TrafficSums sums = WalkSnapshot(snapshot, seconds);
  RemoveUnmarkedRows();
  controls_.main_lblUpload.Caption = MeterText(sums.upload);
  controls_.main_lblDownload.Caption = MeterText(sums.download);
  ports_.MergeIntoRows();
  controls_.main_ListView1.Sort(kDownloadCell, forms::SortOrder::Descending);
}

void ProcessTable::RefreshWhenDue() {
  if (SinceLastRefresh() < kRefreshInterval) return;
  if (!PageIsOpen()) return;
  RefreshProcessTable({});
  StampLastRefresh();
}

void ProcessTable::StampLastRefresh() { LastRefreshTick = static_cast<std::int32_t>(system_.GetTickCount()); }

void ProcessTable::SeedLastRefresh() { LastRefreshTick = system_.DayNumber(); }

std::uint32_t ProcessTable::SinceLastRefresh() const {
  return system_.GetTickCount() - static_cast<std::uint32_t>(LastRefreshTick);
}

void ProcessTable::ClearMarks() {
  for (int i = 1; i <= controls_.main_ListView1.Count(); ++i)
    controls_.main_ListView1.Row(i).CellTag(kApplicationCell) = Text();
}

TrafficSums ProcessTable::WalkSnapshot(platform::Handle snapshot, double seconds) {
  const OwnedHandle owner(processes_, snapshot);
  const PortsByOwner ports = ports_.OfNewRows();
  // One text for the whole pass: a process of an unknown parent takes the class of the row added before it.
  Text classOfRow;
  TrafficSums sums;
  platform::Processes::Entry entry;
  for (bool more = processes_.Process32First(snapshot, entry); more;
       more = processes_.Process32Next(snapshot, entry)) {
    if (forms::ListRow* row = controls_.main_ListView1.Find(KeyOfProcess(entry.processId))) {
      row->CellTag(kApplicationCell) = kAlive;
      UpdateRates(*row, seconds, sums);
    } else {
      adder_.Add(entry, ports.TextOf(entry.processId), classOfRow);
    }
  }
  return sums;
}

void ProcessTable::RemoveUnmarkedRows() {
  forms::ListView& list = controls_.main_ListView1;
  const Variant alive(kAlive);
  // The last row is never examined, and the row that slides into a removed one's place is skipped: both wait
  // for a later pass.
  for (int i = 1; i < list.Count(); ++i)
    if (list.Row(i).CellTag(kApplicationCell) != alive) list.Remove(i);
}

} // namespace quendra::monitor
