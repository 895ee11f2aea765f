#include "monitor/ProcessTable.h"

#include "forms/Desktop.h"
#include "monitor/OwnedHandle.h"
#include "monitor/PortsByOwner.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessRowAdder.h"
#include "platform/process/Tokens.h"
#include "platform/system/System.h"

namespace quendra::monitor {

namespace {

constexpr std::int32_t kSocketHandleVersion = 2000;
constexpr std::int32_t kTcpOwnerVersion = 2002;

} // namespace

ProcessTable::ProcessTable(const platform::Machine& machine, forms::Desktop& desktop, MonitorPage page,
                           MonitorFields& fields, mdlFileInfo& fileInfo, modProcPort& procPort)
    : machine_(machine), desktop_(desktop), page_(page), fields_(fields), fileInfo_(fileInfo),
      procPort_(procPort) {}

void ProcessTable::RefreshProcessTable(const Text&) {
  const double seconds = SecondsSinceLastRefresh();
  ClearMarks();
  const platform::Handle snapshot =
      machine_.processes.CreateToolhelp32Snapshot(platform::Processes::kSnapProcess, 0);
  if (snapshot == platform::kInvalidHandle) return;
  const TrafficSums sums = WalkSnapshot(snapshot, seconds);
  RemoveUnmarkedRows();
  page_.main_lblUpload.Caption = MeterText(sums.upload);
  page_.main_lblDownload.Caption = MeterText(sums.download);
  if (fields_.OsVersionCode == kTcpOwnerVersion) {
    // Without a new table the one before is walked again.
    procPort_.FetchTcpOwnerTable();
    procPort_.MergeTcpPorts();
  }
  page_.main_ListView1.Sort(kDownloadCell, forms::SortOrder::Descending);
}

double ProcessTable::SecondsSinceLastRefresh() const {
  return fields_.SinceLastRefresh(machine_.system.GetTickCount()) / 1000.0;
}

void ProcessTable::ClearMarks() {
  for (int i = 1; i <= page_.main_ListView1.Count(); ++i)
    page_.main_ListView1.Row(i).CellTag(kApplicationCell) = Text();
}

TrafficSums ProcessTable::WalkSnapshot(platform::Handle snapshot, double seconds) {
  const OwnedHandle owner(machine_.processes, snapshot);
  const PortsByOwner ports =
      fields_.OsVersionCode == kSocketHandleVersion ? PortsOfAllProcesses() : PortsByOwner();
  ProcessRowAdder adder(machine_, desktop_, page_, fileInfo_);
  TrafficSums sums;
  platform::Processes::Entry entry;
  for (bool more = machine_.processes.Process32First(snapshot, entry); more;
       more = machine_.processes.Process32Next(snapshot, entry)) {
    if (forms::ListRow* row = page_.main_ListView1.Find(KeyOfProcess(entry.processId))) {
      row->CellTag(kApplicationCell) = kAlive;
      UpdateRates(*row, seconds, sums);
    } else {
      adder.Add(entry, ports.TextOf(entry.processId));
    }
  }
  return sums;
}

PortsByOwner ProcessTable::PortsOfAllProcesses() {
  if (!SeDebugEnabled)
    SeDebugEnabled = fileInfo_.EnablePrivilege(u"SeDebugPrivilege", platform::Tokens::kEnabled);
  PortsByOwner ports;
  const bool scanned = procPort_.ScanSocketHandles();
  if (!scanned || !SeDebugEnabled) return ports;
  for (std::uint32_t port = 0; port < procPort_.PortOwnerTable.size(); ++port)
    if (const std::int32_t owner = procPort_.PortOwnerTable[port].tcpOwner)
      ports.Add(static_cast<std::uint32_t>(owner), port);
  return ports;
}

void ProcessTable::RemoveUnmarkedRows() {
  forms::ListView& list = page_.main_ListView1;
  const Variant alive(kAlive);
  // The last row is never examined, and the row that slides into a removed one's place is skipped: both wait
  // for a later pass.
  for (int i = 1; i < list.Count(); ++i)
    if (list.Row(i).CellTag(kApplicationCell) != alive) list.Remove(i);
}

} // namespace quendra::monitor
