#pragma once

#include "forms/MessageLoop.h"
#include "forms/controls/Controls.h"
#include "foundation/CSocketPlus.h"
#include "monitor/ProcessTable.h"
#include "report/ReportControls.h"

#include <memory>

namespace quendra::report {

/// The exchange with the support server over the sockets of the monitor page: 1 fetches a page that nobody
/// reads and is never connected, 2 fetches a report number, 3 posts the report, 4 downloads a load. What
/// comes next follows from the order of their events; leaving the page ends the exchange without a message.
class SupportExchange {
 public:
  SupportExchange(foundation::modSocketPlus& module, forms::MessageLoop& loop, ReportControls& controls,
                  monitor::ProcessTable& table, forms::Timer& main_Timer1);

  /// The sockets' half of the page's start.
  void PrepareSockets();
  /// The sockets' half of the page's stop.
  void ReleaseSockets();

  void main_cmdRpt_Click();
  void main_Label2_DblClick();
  void main_Label3_DblClick();

  /// nullptr while the page isn't open.
  foundation::CSocketPlus* Sockets() { return main_spSockets_.get(); }

  Text ProcsPageText; ///< gathered and never read
  Text ReportNumber;
  Text ReportReply; ///< what has come of the reply to the report

 private:
  using Index = const Variant&;

  void main_spSockets_Connect(Index index);
  void main_spSockets_DataArrival(Index index);
  void main_spSockets_CloseSck(Index index);
  void main_spSockets_Error(Index index, std::int16_t number, const Text& description);

  foundation::CSocketPlus& OpenSockets();
  // A socket leaves its closed state and comes back to it by these two alone.
  void Connect(std::int16_t index, TextView host);
  void Close(std::int16_t index);
  /// Enables the button while a press can be taken. A press would end the program while socket 2 or 3 is in
  /// use, failed ones included, and from the showing of a number until its report is posted.
  void OfferReport();
  Text TakeText(Index index);
  void NumberArrived();
  void ReportClosed();
  /// Both are false when the page was left while the box stood: the exchange has ended with it.
  bool ShowNumber(const Text& number);
  bool ShowHebrewBox(const Text& text, int icon);

  static constexpr std::int16_t kProcsPage = 1;
  void ProcsPageClosed();
  void ReadProcsPage();

  foundation::modSocketPlus& module_;
  forms::MessageLoop& loop_;
  ReportControls& controls_;
  monitor::ProcessTable& table_;
  forms::Timer& main_Timer1_;
  std::shared_ptr<foundation::CSocketPlus> main_spSockets_;
  int standingNumberBoxes_ = 0;
};

} // namespace quendra::report
