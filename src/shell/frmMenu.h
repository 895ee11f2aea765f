#pragma once

#include "forms/Desktop.h"
#include "forms/Page.h"
#include "forms/controls/ControlArray.h"
#include "monitor/SystemVersion.h"
#include "shell/HandCursor.h"
#include "shell/IpPanel.h"
#include "shell/MenuHighlight.h"
#include "shell/MenuPages.h"

namespace quendra::shell {

/// The main window: its menu, and pages of which it knows no more than their table. Unloading it ends the
/// program, save when its Tag holds "not close".
class frmMenu : public forms::PageWindow {
  using Label = forms::Label;
  using PictureBox = forms::PictureBox;

 public:
  frmMenu(forms::Desktop& desktop, forms::Form& about, monitor::SystemVersion& version,
          const capture::HostAddresses& addresses);

  /// Pages come in the order of their table.
  void Add(forms::Page& page) { pages_.Add(page); }

  void Design() override;
  void Form_Load() override;
  void Form_Unload() override;
  void Form_Activate() override { InBackground = kFalse16; }
  void Form_Deactivate() override { InBackground = kTrue16; }
  void Form_KeyDown(int keyCode, int shift) override;

  /// The last step of the load.
  forms::Event<> StartCaptureLibrary;

  // Background and menu.
  PictureBox picOut{*this, u"picOut"};
  Label lblWelcome{picOut, u"lblWelcome"};
  Label lblWelcomeHint{picOut, u"lblWelcomeHint"};
  std::array<PictureBox, kEntryCount> PicMenu =
      forms::ControlArray<PictureBox, kEntryCount>(*this, u"PicMenu");
  MenuHighlight::Lines linMenu1 = LinesOnSecondRow(u"linMenu1");
  MenuHighlight::Lines linMenu2 = LinesOnSecondRow(u"linMenu2");
  std::array<Label, kEntryCount> lblCaption = forms::ControlArrayOn<Label>(PicMenu, u"lblCaption");
  Label Label1{*this, u"Label1"};
  std::array<PictureBox, kPageCount> picMenu2 =
      forms::ControlArray<PictureBox, kPageCount>(*this, u"picMenu2");
  std::array<PictureBox, kPageCount> picMenu3 =
      forms::ControlArray<PictureBox, kPageCount>(*this, u"picMenu3");

  void resetButtons() override { pages_.resetButtons(); }
  void ShowHandCursor() override { handCursor_.Show(); }
  bool PageChosen() const { return pages_.PageChosen; }

 private:
  MenuHighlight::Lines LinesOnSecondRow(TextView name);
  void DesignMenu();
  void DesignEntry(std::size_t entry);
  void DesignLines();
  void DesignWelcome();
  void DesignPages();
  void WireMenu();

  void Label1_Click();
  void picOut_MouseMove(int button);

  forms::Desktop& desktop_;
  forms::Form& about_;
  monitor::SystemVersion& version_;
  HandCursor handCursor_;
  MenuHighlight highlight_;
  MenuPages pages_;
  IpPanel ipPanel_;
};

} // namespace quendra::shell
