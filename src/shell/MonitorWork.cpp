#include "shell/MonitorWork.h"

namespace quendra::shell {

MonitorWork::MonitorWork(MonitorPage& page, monitor::ProcessTable& table, report::SupportExchange& support,
                         capture::OwnAddresses& addresses, capture::CaptureSession& capture)
    : table_(table), support_(support), addresses_(addresses), capture_(capture) {
  page.Start = [this] { main_StartPage(); };
  page.Stop = [this] { main_StopPage(); };
  page.main_Timer1.Tick = [this] { main_Timer1_Timer(); };
}

void MonitorWork::main_StartPage() {
  table_.PrepareTable();
  support_.PrepareSockets();
  addresses_.Read();
  table_.SeedLastRefresh();
  table_.RefreshProcessTable({});
  capture_.StartCapture();
}

void MonitorWork::main_StopPage() {
  support_.ReleaseSockets();
  TearDownSniffer();
  capture_.StopCapture();
}

void MonitorWork::main_Timer1_Timer() {
  if (TimerRefreshGate && !table_.SortPinned) table_.RefreshProcessTable({});
  table_.StampLastRefresh();
}

} // namespace quendra::shell
