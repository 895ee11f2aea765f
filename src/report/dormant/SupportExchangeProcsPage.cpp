// The page of processes on the support server: complete, but nothing connects its socket.
#include "report/SupportExchange.h"

namespace quendra::report {

void SupportExchange::ProcsPageClosed() {
  ReadProcsPage();
  Close(kProcsPage);
  table_.RefreshProcessTable({});
  main_Timer1_.Enabled = true;
}

/// Reserved for reading the page into a table of 3 by 3 texts, which is made and dropped.
void SupportExchange::ReadProcsPage() { const Text table[3][3]; }

} // namespace quendra::report
