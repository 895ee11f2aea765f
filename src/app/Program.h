#pragma once

#include "capture/CaptureSession.h"
#include "capture/HostAddresses.h"
#include "capture/PacketAttribution.h"
#include "forms/Desktop.h"
#include "foundation/modSocketPlus.h"
#include "monitor/ProcessTable.h"
#include "monitor/mdlFileInfo.h"
#include "monitor/modProcPort.h"
#include "platform/Machine.h"
#include "report/SupportExchange.h"
#include "shell/MonitorPageSwitch.h"
#include "shell/frmAbout.h"
#include "shell/frmMenu.h"
#include "shell/frmSplash.h"

namespace quendra::app {

/// The whole program over one machine and one desktop: its forms and the one object of each of its modules.
/// Nothing of it is shared, so that several programs can live side by side.
class Program {
 public:
  Program(const platform::Machine& machine, forms::Desktop& desktop);
  Program(const Program&) = delete;

  /// Shows the splash; everything else follows from what the user does.
  void Start();

 private:
  forms::Desktop& desktop_;

 public:
  // The forms come first: modules are made over the main window's controls, and a form uses them only once it
  // is loaded.
  shell::frmSplash frmSplash;
  shell::frmAbout frmAbout;
  shell::frmMenu frmMenu;

  monitor::MonitorFields monitorFields;
  monitor::mdlFileInfo mdlFileInfo;
  monitor::modProcPort modProcPort;
  monitor::ProcessTable processTable;

  capture::CaptureFields captureFields;
  capture::HostAddresses hostAddresses;
  capture::PacketAttribution packetAttribution;
  capture::CaptureSession captureSession;

  foundation::modSocketPlus modSocketPlus;
  report::SupportExchange supportExchange;

  shell::MonitorPageSwitch monitorPageSwitch;
};

} // namespace quendra::app
