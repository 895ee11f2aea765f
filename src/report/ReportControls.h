#pragma once

#include "forms/controls/Controls.h"

namespace quendra::report {

/// What the user presses for the exchange with the support server: its button, and two captions of the page
/// that are its hidden switches.
class ReportControls {
 public:
  ReportControls(forms::Frame& page, forms::Label& stopsLoad, forms::Label& startsLoad)
      : main_cmdRpt(page, u"main_cmdRpt"), main_Label2(stopsLoad), main_Label3(startsLoad) {}

  forms::Label main_cmdRpt;
  forms::Label& main_Label2;
  forms::Label& main_Label3;
};

} // namespace quendra::report
