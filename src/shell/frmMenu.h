#pragma once

#include "forms/ComboBox.h"
#include "forms/Desktop.h"
#include "forms/ListView.h"
#include "monitor/MonitorPage.h"
#include "platform/Machine.h"
#include "shell/ControlArray.h"
#include "shell/HandCursor.h"
#include "shell/IpPanel.h"
#include "shell/MenuHighlight.h"
#include "shell/MenuPages.h"
#include "shell/MonitorPageSwitch.h"

namespace quendra::monitor {
class modProcPort;
}

namespace quendra::shell {

class frmAbout;
class frmSplash;

/// What the main window drives. Bound when the window is made, used from its load on, so that the modules may
/// be made over the window's controls.
struct MenuModules {
  MonitorPageSwitch& monitorPage;
  monitor::ProcessTable& processTable;
  monitor::modProcPort& modProcPort;
  capture::CaptureSession& captureSession;
  report::SupportExchange& supportExchange;
  const capture::HostAddresses& hostAddresses;
  monitor::MonitorFields& fields;
};

/// The main window: its menu and three pages. Unloading it ends the program, save when its Tag holds "not
/// close".
class frmMenu : public forms::Form {
  using Frame = forms::Frame;
  using Label = forms::Label;
  using PictureBox = forms::PictureBox;
  using Timer = forms::Timer;

 public:
  frmMenu(const platform::Machine& machine, forms::Desktop& desktop, frmSplash& splash, frmAbout& about,
          MenuModules modules);

  void Design() override;
  void Form_Load() override;
  void Form_Unload() override;
  void Form_Activate() override { inBackground_ = kFalse16; }
  void Form_Deactivate() override { inBackground_ = kTrue16; }
  void Form_KeyDown(int keyCode, int shift) override;

  // Background and menu. The second row of entries, 3 to 5, repeats the first in reverse order.
  PictureBox picOut{*this, u"picOut"};
  Label lblWelcome{picOut, u"lblWelcome"};
  Label lblWelcomeHint{picOut, u"lblWelcomeHint"};
  std::array<PictureBox, 6> PicMenu = ControlArray<PictureBox, 6>(*this, u"PicMenu");
  MenuHighlight::Lines linMenu1 = LinesOnSecondRow(u"linMenu1");
  MenuHighlight::Lines linMenu2 = LinesOnSecondRow(u"linMenu2");
  std::array<Label, 6> lblCaption = ControlArrayOn<Label>(PicMenu, u"lblCaption");
  Label Label1{*this, u"Label1"};
  std::array<PictureBox, 3> picMenu2 = ControlArray<PictureBox, 3>(*this, u"picMenu2");
  std::array<PictureBox, 3> picMenu3 = ControlArray<PictureBox, 3>(*this, u"picMenu3");

  // Monitor page.
  Frame frameMain{*this, u"frameMain"};
  Label main_Label4{frameMain, u"main_Label4"};
  Label main_Label2{frameMain, u"main_Label2"};
  Label main_lblUpload{frameMain, u"main_lblUpload"};
  Label main_lblUploadUnit{frameMain, u"main_lblUploadUnit"};
  Label main_Label3{frameMain, u"main_Label3"};
  Label main_lblDownload{frameMain, u"main_lblDownload"};
  Label main_lblDownloadUnit{frameMain, u"main_lblDownloadUnit"};
  forms::ListView main_ListView1{frameMain, u"main_ListView1"};
  Label main_lblEndProcess{frameMain, u"main_lblEndProcess"};
  Label main_lblJumpToPath{frameMain, u"main_lblJumpToPath"};
  Label main_cmdChecks{frameMain, u"main_cmdChecks"};
  Label main_cmdMemInfo{frameMain, u"main_cmdMemInfo"};
  Label main_cmdAddRemove{frameMain, u"main_cmdAddRemove"};
  Label main_cmdRpt{frameMain, u"main_cmdRpt"};
  Frame main_Frame1{frameMain, u"main_Frame1"};
  forms::ComboBox main_cmbAdapters{main_Frame1, u"main_cmbAdapters"};
  Label main_lblCaptureState{main_Frame1, u"main_lblCaptureState"};
  PictureBox main_Pic{frameMain, u"main_Pic"};
  forms::ImageList main_ImList{frameMain, u"main_ImList"};
  forms::ImageList main_headersIL{frameMain, u"main_headersIL"};
  Timer main_Timer1{*this, u"main_Timer1", 1000, false};
  Timer main_Timer2{*this, u"main_Timer2", 1000, false};

  // Page for surf problems.
  Frame frameSurfProb{*this, u"frameSurfProb"};
  Label surf_lblTitle{frameSurfProb, u"surf_lblTitle"};
  Label surf_lblBack{frameSurfProb, u"surf_lblBack"};
  Timer surf_Timer1{*this, u"surf_Timer1", 100, false};

  // Page for the first connection.
  Frame frameFirstConnection{*this, u"frameFirstConnection"};
  Label frsCon_lblTitle{frameFirstConnection, u"frsCon_lblTitle"};
  Label frsCon_lblBack{frameFirstConnection, u"frsCon_lblBack"};

  monitor::MonitorPage Page();
  void resetButtons() { pages_.resetButtons(); }
  bool PageChosen() const { return pages_.PageChosen; }
  /// Kept at each activation and deactivation; nothing reads it.
  Boolean16 InBackground() const { return inBackground_; }

 private:
  MenuHighlight::Lines LinesOnSecondRow(TextView name);
  void DesignMenu();
  void DesignEntry(std::size_t entry);
  void DesignLines();
  void DesignWelcome();
  void DesignPages();
  void DesignPageWithoutContent(Label& title, Label& back, const char16_t* caption);
  void DesignMonitorPage();
  void DesignMeters();
  void DesignTable();
  void DesignActions();
  void DesignAdapters();

  MenuPages::Pages PageTable();
  void WireMenu();
  void WireMonitorPage();
  void WireOtherPages();
  void WireHandCursor();

  void ReadOsVersion();
  void StartCaptureLibrary();
  void RegisterCaptureControl();
  void Label1_Click();
  void picOut_MouseMove(int button);
  void surf_Timer1_Timer();
  void surf_StartChecks();
  void surf_StopChecks();
  void PrepareFirstConnectionPage();
  void CloseFirstConnectionPage();

  platform::System& system_;
  platform::ShellStart& shellStart_;
  forms::Desktop& desktop_;
  frmSplash& splash_;
  frmAbout& about_;
  MenuModules modules_;
  HandCursor handCursor_;
  MenuHighlight highlight_;
  MenuPages pages_;
  IpPanel ipPanel_;
  Boolean16 inBackground_ = kFalse16;
};

} // namespace quendra::shell
