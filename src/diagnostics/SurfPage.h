#pragma once

#include "forms/Page.h"

namespace quendra::diagnostics {

/// The page for surf problems.
class SurfPage : public forms::Page {
 public:
  SurfPage(forms::PageWindow& window, const forms::PageRow& row);

  void Design() override;

  forms::Frame& frameSurfProb = frame;
  forms::Label surf_lblTitle{frame, u"surf_lblTitle"};
  forms::Label surf_lblBack{frame, u"surf_lblBack"};
  forms::Timer surf_Timer1{window, u"surf_Timer1", 100, false};

 private:
  void surf_StartChecks();
  void surf_StopChecks();
};

} // namespace quendra::diagnostics
