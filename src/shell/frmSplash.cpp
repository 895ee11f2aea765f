#include "shell/frmSplash.h"

#include "runtime/Integers.h"
#include "shell/Agreement.h"
#include "shell/frmMenu.h"

namespace quendra::shell {

namespace {

/// Room that the agreement leaves free beside its lines, in pixels.
constexpr int kSideRoom = 30;
/// Letters may reach a pixel beyond their measured width.
constexpr int kLinkRoom = 1;

} // namespace

frmSplash::frmSplash(forms::Desktop& desktop, frmMenu& menu)
    : Form(u"frmSplash"), desktop_(desktop), menu_(menu), handCursor_(desktop),
      roll_(desktop, {picOut, picBuffer, picBackBuffer}, ReDrawTimer, lines_) {
  Default = &Label2;
  Label1.Click = [this] { ShowAgreement(); };
  Label2.Click = [this] { Label2_Click(); };
  Label3.Click = [this] { desktop_.Unload(*this); };
  picOut.Click = [this] { HideAgreement(); };
  ReDrawTimer.Tick = [this] { roll_.Tick(); };
}

void frmSplash::Form_Load() {
  handCursor_.Load();
  handCursor_.ShowOverButtons(*this);
  lines_.Wrap(AgreementText(), desktop_.ScaleWidth(picBuffer) - kSideRoom,
              [this](TextView text) { return desktop_.TextWidth(picBuffer, text); });
  HideAgreement();
  PlaceLinkOnItsWord();
}

/// The warning's last word is the link's caption: where it lies depends on the letters that the system has.
void frmSplash::PlaceLinkOnItsWord() {
  const TextView warning = lblWarning.Caption();
  const TextView before = warning.substr(0, warning.rfind(Label1.Caption()));
  const double twips = desktop_.TwipsPerPixelX();
  forms::Geometry place = lblWarning.Position;
  place.left += RoundToInt32(desktop_.TextWidth(picBuffer, before) * twips);
  place.width = RoundToInt32((desktop_.TextWidth(picBuffer, Label1.Caption()) + kLinkRoom) * twips);
  Label1.Position = place;
}

void frmSplash::ShowAgreement() {
  roll_.Show();
  Cancel = &picOut;
}

void frmSplash::HideAgreement() {
  roll_.Hide();
  Cancel = &Label3;
}

void frmSplash::Label2_Click() {
  Tag = Text();
  desktop_.Show(menu_);
  if (!menu_.Tag().empty()) desktop_.Unload(menu_);
  if (Tag().empty()) desktop_.Unload(*this);
}

} // namespace quendra::shell
