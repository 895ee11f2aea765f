#pragma once

#include "app/ConnectionWing.h"
#include "app/SurfWing.h"
#include "capture/CaptureSession.h"
#include "capture/HostAddresses.h"
#include "capture/PacketAttribution.h"
#include "capture/dormant/Sniffer.h"
#include "diagnostics/SurfPage.h"
#include "diagnostics/dialogs/frmAbout.h"
#include "diagnostics/dialogs/frmMemInfo.h"
#include "diagnostics/dialogs/frmPortsChecks.h"
#include "forms/Desktop.h"
#include "foundation/modSocketPlus.h"
#include "monitor/ProcessTable.h"
#include "platform/Machine.h"
#include "report/SupportExchange.h"
#include "shell/CaptureSetup.h"
#include "shell/MonitorPage.h"
#include "shell/MonitorWork.h"
#include "shell/PageDialogs.h"
#include "shell/ProcessActions.h"
#include "shell/frmMenu.h"
#include "shell/frmSplash.h"

namespace quendra::app {

/// The whole program over one machine and one desktop: its forms, its pages and the one object of each of its
/// modules. Nothing of it is shared, so that several programs can live side by side.
class Program {
 public:
  Program(const platform::Machine& machine, forms::Desktop& desktop);
  Program(const Program&) = delete;

  /// Shows the splash; everything else follows from what the user does.
  void Start();

 private:
  void OfferDialogs();

  forms::Desktop& desktop_;

 public:
  // What only asks the machine.
  monitor::SystemVersion systemVersion;
  capture::HostAddresses hostAddresses;

  // Forms.
  diagnostics::frmAbout frmAbout;
  diagnostics::frmMemInfo frmMemInfo;
  shell::frmMenu frmMenu;
  shell::frmSplash frmSplash;

  // Pages.
  shell::MonitorPage monitorPage;
  diagnostics::SurfPage surfPage;
  provisioning::FirstConnectionPage firstConnectionPage;

  // Modules.
  monitor::mdlFileInfo mdlFileInfo;
  monitor::modProcPort modProcPort;
  monitor::ProcessRowAdder processRowAdder;
  monitor::PortSource portSource;
  monitor::ProcessTable processTable;

  capture::OwnAddresses ownAddresses;
  capture::PacketControl packetControl;
  capture::PacketAttribution packetAttribution;
  capture::CaptureSession captureSession;

  capture::Sniffer sniffer;

  foundation::modSocketPlus modSocketPlus;
  report::SupportExchange supportExchange;

  SurfWing surf;
  ConnectionWing connection;
  diagnostics::frmPortsChecks frmPortsChecks;

  shell::CaptureSetup captureSetup;
  shell::MonitorWork monitorWork;
  shell::ProcessActions processActions;
  shell::PageDialogs pageDialogs;
};

} // namespace quendra::app
