#pragma once

#include "forms/controls/Controls.h"

namespace quendra::diagnostics {

/// The panel of the surf page that traces the route to a host. It lies over the list while it is open; the
/// page's back link closes it first.
class AdvancedPanel {
 public:
  explicit AdvancedPanel(forms::Frame& page);

  void Design(const forms::Geometry& place);

  /// Traces the route to a host, writes the report and frees `frmSurf_cmdStart` in the end.
  forms::Event<const Text&> Trace;

  forms::Frame frmSurf_frameAdvanced;
  forms::Label Label2{frmSurf_frameAdvanced, u"Label2"};
  forms::ComboBox frmSurf_txtping{frmSurf_frameAdvanced, u"frmSurf_txtping"};
  forms::CommandButton frmSurf_cmdStart{frmSurf_frameAdvanced, u"frmSurf_cmdStart"};
  forms::TextBox frmSurf_txtPingResult{frmSurf_frameAdvanced, u"frmSurf_txtPingResult"};

 private:
  void DesignTarget();
  void frmSurf_cmdStart_Click();
};

} // namespace quendra::diagnostics
