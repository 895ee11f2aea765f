#pragma once

#include "capture/AdapterControls.h"
#include "forms/Page.h"
#include "monitor/TableControls.h"
#include "report/ReportControls.h"

namespace quendra::shell {

/// The monitor page, which brings the process table, the report and the capture together.
class MonitorPage : public forms::Page {
  using Label = forms::Label;

 public:
  using Page::Page;

  void Design() override;

  forms::Frame& frameMain = frame;
  monitor::TableControls table{frame};
  Label main_lblEndProcess{frame, u"main_lblEndProcess"};
  Label main_lblJumpToPath{frame, u"main_lblJumpToPath"};
  Label main_cmdChecks{frame, u"main_cmdChecks"};
  Label main_cmdMemInfo{frame, u"main_cmdMemInfo"};
  Label main_cmdAddRemove{frame, u"main_cmdAddRemove"};
  report::ReportControls reporting{frame, table.main_Label2, table.main_Label3};
  capture::AdapterControls adapters{frame};
  forms::Timer main_Timer1{window, u"main_Timer1", 1000, false};
  forms::Timer main_Timer2{window, u"main_Timer2", 1000, false};

 private:
  void DesignMeters();
  void DesignTable();
  void DesignActions();
  void DesignAdapters();
};

} // namespace quendra::shell
