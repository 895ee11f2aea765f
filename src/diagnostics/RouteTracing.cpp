#include "diagnostics/RouteTracing.h"

namespace quendra::diagnostics {

RouteTracing::RouteTracing(AdvancedPanel& panel, const mdlTracert::Network& network, forms::FormHost& forms,
                           forms::MessageLoop& loop, platform::KeyboardLayout& layout)
    : mdlTracert_(network, loop, panel.frmSurf_cmdStart), normaliser_(layout) {
  panel.Trace = [this, &panel, &forms](const Text& host) {
    // The look-up of a name may hold the thread for long, and the first pause comes after it.
    forms.Repaint(panel.frmSurf_frameAdvanced);
    mdlTracert_.Trace(host, panel.frmSurf_txtPingResult);
  };
  panel.frmSurf_txtping.KeyPress = [this](int& keyCode) { normaliser_.MendKeyPress(keyCode, 0); };
}

} // namespace quendra::diagnostics
