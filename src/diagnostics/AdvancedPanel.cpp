#include "diagnostics/AdvancedPanel.h"

#include "foundation/Looks.h"
#include "runtime/Settings.h"

namespace quendra::diagnostics {

namespace looks = foundation::looks;
using foundation::Px;

namespace {

constexpr const char16_t* kStart = u"התחל";
constexpr const char16_t* kWait = u"המתן";

constexpr const char16_t* kTargets[] = {settings::ProbeWebHost, u"www.example.com", u"www.example.org"};

} // namespace

AdvancedPanel::AdvancedPanel(forms::Frame& page) : frmSurf_frameAdvanced(page, u"frmSurf_frameAdvanced") {
  frmSurf_txtping.FreeText = true;
  frmSurf_txtping.GotFocus = [this] {
    frmSurf_txtping.SelStart = 0;
    frmSurf_txtping.SelLength = static_cast<int>(frmSurf_txtping.Value().size());
  };
  frmSurf_txtPingResult.MultiLine = true;
  frmSurf_txtPingResult.Change = [this] {
    frmSurf_txtPingResult.SelStart = static_cast<int>(frmSurf_txtPingResult.Value().size());
  };
  frmSurf_cmdStart.Click = [this] { frmSurf_cmdStart_Click(); };
}

void AdvancedPanel::Design(const forms::Geometry& place) {
  frmSurf_frameAdvanced.Border = false;
  frmSurf_frameAdvanced.BackColour = looks::kPaper;
  frmSurf_frameAdvanced.Position = place;
  frmSurf_frameAdvanced.Visible = false;
  DesignTarget();
  frmSurf_txtPingResult.Value = Text();
  frmSurf_txtPingResult.ReadOnly = true;
  frmSurf_txtPingResult.VerticalScrollBar = true;
  frmSurf_txtPingResult.Monospaced = true;
  frmSurf_txtPingResult.TextFont = looks::kBody;
  frmSurf_txtPingResult.Description = u"תוצאות המעקב";
  frmSurf_txtPingResult.Move(Px(14), Px(52), place.width - Px(28), place.height - Px(60));
}

void AdvancedPanel::DesignTarget() {
  looks::PlainText(Label2, u"כתובת מעקב:", looks::kBody);
  Label2.Move(Px(14), Px(12), Px(110), Px(24));
  frmSurf_txtping.Clear();
  for (const char16_t* target : kTargets) frmSurf_txtping.AddItem(target);
  frmSurf_txtping.Value = Text();
  frmSurf_txtping.TextFont = looks::kBody;
  frmSurf_txtping.Move(Px(128), Px(8), Px(380), Px(30));
  looks::Button(frmSurf_cmdStart, kStart);
  frmSurf_cmdStart.Move(Px(520), Px(8), Px(120), Px(30));
}

// Only the end of a trace frees the button: a press without a target leaves it waiting.
void AdvancedPanel::frmSurf_cmdStart_Click() {
  if (frmSurf_cmdStart.Caption() != kStart) {
    frmSurf_cmdStart.Enabled = true;
    frmSurf_cmdStart.Caption = Text(kStart);
    return;
  }
  frmSurf_cmdStart.Caption = Text(kWait);
  frmSurf_cmdStart.Enabled = false;
  frmSurf_txtPingResult.Value = Text();
  const Text target = frmSurf_txtping.Value;
  if (!target.empty()) Trace(target);
}

} // namespace quendra::diagnostics
