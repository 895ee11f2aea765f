#pragma once

#include "capture/CaptureSession.h"
#include "capture/PacketAttribution.h"
#include "capture/TestFrames.h"
#include "forms/headless/HeadlessDesktop.h"
#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessTable.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::capture {

/// The monitor page, its table and its capture on a simulated machine. The host's own addresses are
/// 192.168.7.1, then 10.0.0.138; the page is open. No pass of the table is due until `LetSecondPass`.
struct CaptureProgram : testing::Test {
  CaptureProgram() {
    machine.hostNames.Addresses = {"192.168.7.1", kOwnAddress};
    machine.AddCaptureAdapter({"eth0", "Card A", kOwnAddress});
    table.StampLastRefresh();
  }

  /// As the main window's load and the page's start bring it up.
  void StartCapture() {
    session.InitLibrary();
    control.Create();
    addresses.Read();
    session.StartCapture();
  }

  /// Delivers the frames and signals once.
  void Receive(std::initializer_list<Bytes> frames) {
    for (const Bytes& frame : frames) machine.Deliver(frame);
    machine.SignalPackets();
  }

  void LetSecondPass() { machine.AdvanceTick(1000); }
  int Passes() const { return machine.processes.SnapshotsTaken; }

  forms::ListRow& AddRow(std::uint32_t id, const Text& ports) {
    return monitor::AddBareRow(form.main_ListView1, monitor::KeyOfProcess(id), ports);
  }
  /// Running totals of a row, in kilobytes.
  static double Upload(const forms::ListRow& row) { return row.CellTag(monitor::kUploadCell).Number(); }
  static double Download(const forms::ListRow& row) { return row.CellTag(monitor::kDownloadCell).Number(); }

  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  monitor::MonitorControls form;
  AdapterControls adapters{form.frameMain};
  monitor::SystemVersion version{machine.system, desktop};
  monitor::mdlFileInfo fileInfo{machine.processes, machine.tokens, machine.versionInfo, desktop};
  monitor::modProcPort procPort{
      machine.ipHelper, {machine.processes, machine.handles}, desktop, form.main_ListView1, fileInfo};
  monitor::ProcessRowAdder adder{machine.icons, machine.system, desktop, form.table, fileInfo};
  monitor::PortSource ports{version, fileInfo, procPort};
  monitor::ProcessTable table{machine.processes, machine.system, form.table, adder, ports};
  HostAddresses host{machine.hostNames, machine.ipHelper};
  OwnAddresses addresses{host};
  PacketControl control{machine.capture};
  PacketAttribution attribution{machine.capture, desktop, control, addresses, table};
  CaptureSession session{machine.capture, machine.system, adapters, control, addresses};
};

using Calls = std::vector<std::string>;

} // namespace quendra::capture
