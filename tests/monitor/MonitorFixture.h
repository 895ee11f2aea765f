#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessTable.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::monitor {

/// A monitor page over a simulated machine, on the version with a TCP owner table unless the test says
/// otherwise.
struct MonitorFixture : testing::Test {
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  MonitorControls controls;
  SystemVersion version{machine.system, desktop};
  mdlFileInfo fileInfo{machine.processes, machine.tokens, machine.versionInfo, desktop};
  modProcPort procPort{
      machine.ipHelper, {machine.processes, machine.handles}, desktop, controls.main_ListView1, fileInfo};
  ProcessRowAdder adder{machine.icons, machine.system, desktop, controls.table, fileInfo};
  PortSource ports{version, fileInfo, procPort};
  ProcessTable table{machine.processes, machine.system, controls.table, adder, ports};
  forms::ListView& list = controls.main_ListView1;

  MonitorFixture() {
    version.OsVersionCode = 2002;
    table.StampLastRefresh();
  }

  std::int32_t Tick() { return static_cast<std::int32_t>(machine.system.GetTickCount()); }

  /// A pass as the page's callers make it: some time on, and the tick is stored after it.
  void Pass(std::uint32_t milliseconds = 1000) {
    machine.AdvanceTick(milliseconds);
    table.RefreshProcessTable(u"");
    table.StampLastRefresh();
  }

  void AddProcesses(std::initializer_list<std::uint32_t> ids) {
    for (const std::uint32_t id : ids) machine.AddProcess({id, 9999, "a.exe", ""});
  }

  bool HasRow(std::uint32_t processId) { return list.Find(KeyOfProcess(processId)) != nullptr; }
  forms::ListRow& Row(std::uint32_t processId) {
    forms::ListRow* row = list.Find(KeyOfProcess(processId));
    return row ? *row : throw std::runtime_error("no row of process " + std::to_string(processId));
  }
  Text CellOf(std::uint32_t processId, int cell) { return Row(processId).CellText(cell); }
  Text PortsOf(std::uint32_t processId) { return CellOf(processId, kPortsCell); }
  Text ClassOf(std::uint32_t processId) { return CellOf(processId, kClassCell); }

  /// Traffic as the capture side charges it, in kilobytes.
  void Charge(std::uint32_t processId, double upload, double download) {
    forms::ListRow& row = Row(processId);
    row.CellTag(kUploadCell) = row.CellTag(kUploadCell).Number() + upload;
    row.CellTag(kDownloadCell) = row.CellTag(kDownloadCell).Number() + download;
  }

  /// The process ids from the first row to the last.
  std::vector<std::int64_t> Order() {
    std::vector<std::int64_t> ids;
    for (int i = 1; i <= list.Count(); ++i) ids.push_back(ProcessIdOfKey(list.Row(i).Key()));
    return ids;
  }
};

/// The number of the fault that the work raises, 0 for none.
template <typename Work> int FaultNumberOf(Work work) {
  try {
    work();
  } catch (const Fault& fault) {
    return fault.number;
  }
  return 0;
}

} // namespace quendra::monitor
