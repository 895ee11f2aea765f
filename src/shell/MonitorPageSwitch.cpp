#include "shell/MonitorPageSwitch.h"

#include "platform/system/System.h"

namespace quendra::shell {

void MonitorPageSwitch::main_StartPage() {
  table_.PrepareTable();
  support_.PrepareSockets();
  capture_.ReadLocalAddresses();
  // A day number lies far below any tick, so that the first packet finds a second over and refreshes at once.
  fields_.LastRefreshTick = system_.DayNumber();
  table_.RefreshProcessTable({});
  capture_.StartCapture();
}

void MonitorPageSwitch::main_StopPage() {
  support_.ReleaseSockets();
  capture_.StopCapture();
}

void MonitorPageSwitch::main_Timer1_Timer() {
  if (TimerRefreshGate && !table_.SortPinned) table_.RefreshProcessTable({});
  fields_.LastRefreshTick = static_cast<std::int32_t>(system_.GetTickCount());
}

} // namespace quendra::shell
