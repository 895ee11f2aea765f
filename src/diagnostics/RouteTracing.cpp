#include "diagnostics/RouteTracing.h"

#include <limits>

namespace quendra::diagnostics {

RouteTracing::RouteTracing(AdvancedPanel& panel, const mdlTracert::Network& network, forms::FormHost& forms,
                           forms::MessageLoop& loop, platform::KeyboardLayout& layout)
    : mdlTracert_(network, loop, panel.frmSurf_cmdStart), normaliser_(layout) {
  panel.Trace = [this, &panel, &forms](const Text& host) {
    // The look-up of a name may hold the thread for long, and the first pause comes after it.
    forms.Repaint(panel.frmSurf_frameAdvanced);
    mdlTracert_.Trace(host, panel.frmSurf_txtPingResult);
  };
  panel.frmSurf_txtping.KeyPress = [this](int& keyCode) { frmSurf_txtping_KeyPress(keyCode); };
}

// Characters beyond 16 bits with a sign have no place in a host's name, and the normaliser none for them.
void RouteTracing::frmSurf_txtping_KeyPress(int& keyCode) {
  std::int16_t character = 0;
  std::int16_t noSpecial = 0;
  if (keyCode >= 0 && keyCode <= std::numeric_limits<std::int16_t>::max()) {
    auto pressed = static_cast<std::int16_t>(keyCode);
    normaliser_.NormaliseKey(pressed, noSpecial, character);
  }
  keyCode = character;
}

} // namespace quendra::diagnostics
