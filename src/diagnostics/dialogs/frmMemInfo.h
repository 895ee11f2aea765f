#pragma once

#include "forms/FormHost.h"
#include "forms/controls/Controls.h"
#include "platform/system/System.h"

namespace quendra::diagnostics {

/// The machine's memory, live.
class frmMemInfo : public forms::Form {
  using Frame = forms::Frame;
  using Label = forms::Label;
  using TextBox = forms::TextBox;

 public:
  frmMemInfo(forms::FormHost& forms, platform::System& system);

  void Design() override;
  void Form_Load() override { ShowFigures(); }

  Frame Frame1{*this, u"Frame1"};
  Label Label1{Frame1, u"Label1"};
  TextBox txtPhysicalMemory{Frame1, u"txtPhysicalMemory"};
  Label Label3{Frame1, u"Label3"};
  TextBox txtAPhysicalMemory{Frame1, u"txtAPhysicalMemory"};
  Frame Frame2{*this, u"Frame2"};
  Label Label2{Frame2, u"Label2"};
  TextBox txtVirtualMemory{Frame2, u"txtVirtualMemory"};
  Label Label4{Frame2, u"Label4"};
  TextBox txtAVirtualMemory{Frame2, u"txtAVirtualMemory"};
  Frame Frame3{*this, u"Frame3"};
  Label Label6{Frame3, u"Label6"};
  TextBox txtPageFile{Frame3, u"txtPageFile"};
  Label Label5{Frame3, u"Label5"};
  TextBox txtAPageFile{Frame3, u"txtAPageFile"};
  Label Label7{Frame3, u"Label7"};
  TextBox txtMemoryUsage{Frame3, u"txtMemoryUsage"};
  forms::CommandButton cmdClose{*this, u"cmdClose"};
  forms::Timer Timer1{*this, u"Timer1", 10, true};

 private:
  void ShowFigures();

  forms::FormHost& forms_;
  platform::System& system_;
};

} // namespace quendra::diagnostics
