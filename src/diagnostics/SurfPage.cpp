#include "diagnostics/SurfPage.h"

#include "foundation/Looks.h"

namespace quendra::diagnostics {

SurfPage::SurfPage(forms::PageWindow& window, const forms::PageRow& row) : Page(window, row) {
  Start = [this] { surf_StartChecks(); };
  Stop = [this] { surf_StopChecks(); };
  surf_lblBack.Click = [this] { surf_StopChecks(); };
}

void SurfPage::Design() {
  foundation::looks::PageHead(surf_lblTitle, surf_lblBack, row.caption, frame.Position().width);
  surf_Timer1.Enabled = false;
  surf_Timer1.Interval = 100;
}

void SurfPage::surf_StartChecks() { window.InBackground = kFalse16; }

void SurfPage::surf_StopChecks() {
  frameSurfProb.Visible = false;
  window.resetButtons();
}

} // namespace quendra::diagnostics
