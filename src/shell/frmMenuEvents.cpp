#include "monitor/ProcessTable.h"
#include "shell/frmMenu.h"

namespace quendra::shell {

MenuHighlight::Lines frmMenu::LinesOnSecondRow(TextView name) {
  const auto holder = [this](std::size_t entry) -> forms::Container& {
    return PicMenu[entry < MenuHighlight::kButtons ? entry + MenuHighlight::kButtons : entry];
  };
  return MakeControls<forms::Line>(name, holder, std::make_index_sequence<MenuHighlight::kEntries>());
}

monitor::MonitorPage frmMenu::Page() {
  return {frameMain,      main_ListView1,   main_ImList,      main_headersIL,      main_Pic,
          main_lblUpload, main_lblDownload, main_cmbAdapters, main_lblCaptureState};
}

MenuPages::Pages frmMenu::PageTable() {
  return {{
      {frameMain, [this] { modules_.monitorPage.main_StartPage(); },
       [this] { modules_.monitorPage.main_StopPage(); }},
      {frameSurfProb, [this] { surf_StartChecks(); }, [this] { surf_StopChecks(); }},
      {frameFirstConnection, [this] { PrepareFirstConnectionPage(); },
       [this] { CloseFirstConnectionPage(); }},
  }};
}

void frmMenu::WireMenu() {
  for (int entry = 0; entry < MenuHighlight::kEntries; ++entry) {
    const auto index = static_cast<std::size_t>(entry);
    lblCaption[index].Click = [this, entry] { pages_.Choose(entry); };
    lblCaption[index].MouseMove = [this, entry](int, int, int, int) {
      handCursor_.Show();
      highlight_.Hover(entry, PageChosen());
    };
    PicMenu[index].MouseMove = [this, entry](int, int, int, int) { highlight_.Hover(entry, PageChosen()); };
  }
  Label1.Click = [this] { Label1_Click(); };
  // The welcome lies on the background and shall not stand in the way of a drag.
  for (forms::Control* background :
       {static_cast<forms::Control*>(&picOut), static_cast<forms::Control*>(&lblWelcome),
        static_cast<forms::Control*>(&lblWelcomeHint)})
    background->MouseMove = [this](int button, int, int, int) { picOut_MouseMove(button); };
}

void frmMenu::WireMonitorPage() {
  main_ListView1.ColumnClick = [this](int header) {
    modules_.processTable.main_ListView1_ColumnClick(header);
  };
  main_cmbAdapters.Click = [this] { modules_.captureSession.main_cmbAdapters_Click(); };
  main_Timer1.Tick = [this] { modules_.monitorPage.main_Timer1_Timer(); };
  main_cmdRpt.Click = [this] { modules_.supportExchange.main_cmdRpt_Click(); };
  main_Label2.DoubleClick = [this] { modules_.supportExchange.main_Label2_DblClick(); };
  main_Label3.DoubleClick = [this] { modules_.supportExchange.main_Label3_DblClick(); };
}

void frmMenu::WireOtherPages() {
  surf_Timer1.Tick = [this] { surf_Timer1_Timer(); };
  surf_lblBack.Click = [this] { surf_StopChecks(); };
  frsCon_lblBack.Click = [this] { CloseFirstConnectionPage(); };
}

void frmMenu::WireHandCursor() {
  for (Label* button : {&Label1, &main_lblEndProcess, &main_lblJumpToPath, &main_cmdAddRemove,
                        &main_cmdChecks, &main_cmdMemInfo, &main_cmdRpt, &surf_lblBack, &frsCon_lblBack})
    button->MouseMove = [this](int, int, int, int) { handCursor_.Show(); };
}

} // namespace quendra::shell
