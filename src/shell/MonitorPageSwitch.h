#pragma once

#include "capture/CaptureSession.h"
#include "monitor/ProcessTable.h"
#include "platform/Machine.h"
#include "report/SupportExchange.h"

namespace quendra::shell {

/// What opens, keeps and leaves the monitor page: the order in which its table, its sockets and its capture
/// are set to work.
class MonitorPageSwitch {
 public:
  MonitorPageSwitch(const platform::Machine& machine, monitor::MonitorFields& fields,
                    monitor::ProcessTable& table, report::SupportExchange& support,
                    capture::CaptureSession& capture)
      : system_(machine.system), fields_(fields), table_(table), support_(support), capture_(capture) {}

  void main_StartPage();
  void main_StopPage();
  /// Stamps the time. A pass would come first, behind a gate that nothing opens.
  void main_Timer1_Timer();

  Boolean16 TimerRefreshGate = kFalse16;

 private:
  platform::System& system_;
  monitor::MonitorFields& fields_;
  monitor::ProcessTable& table_;
  report::SupportExchange& support_;
  capture::CaptureSession& capture_;
};

} // namespace quendra::shell
