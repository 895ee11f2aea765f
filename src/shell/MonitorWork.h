#pragma once

#include "capture/CaptureSession.h"
#include "monitor/ProcessTable.h"
#include "report/SupportExchange.h"
#include "shell/MonitorPage.h"

namespace quendra::shell {

/// What opens, keeps and leaves the monitor page: the order in which its table, its sockets and its capture
/// are set to work.
class MonitorWork {
 public:
  MonitorWork(MonitorPage& page, monitor::ProcessTable& table, report::SupportExchange& support,
              capture::OwnAddresses& addresses, capture::CaptureSession& capture);

  /// Part of the page's stop, after its sockets have gone.
  forms::Event<> TearDownSniffer;

  void main_StartPage();
  void main_StopPage();
  /// Stores the time as that of the last pass. It would make a pass first if TimerRefreshGate were set, which
  /// nothing does.
  void main_Timer1_Timer();

  Boolean16 TimerRefreshGate = kFalse16;

 private:
  monitor::ProcessTable& table_;
  report::SupportExchange& support_;
  capture::OwnAddresses& addresses_;
  capture::CaptureSession& capture_;
};

} // namespace quendra::shell
