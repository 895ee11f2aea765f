#include "provisioning/frmNetworkAdapters.h"

#include "foundation/Looks.h"
#include "runtime/Text.h"

namespace quendra::provisioning {

namespace looks = foundation::looks;
using foundation::Px;

frmNetworkAdapters::frmNetworkAdapters(forms::FormHost& forms) : Form(u"frmNetworkAdapters") {
  Command1.Click = [this] { Command1_Click(); };
  cmdClose.Click = [this, &forms] { forms.Unload(*this); };
  Cancel = &cmdClose;
}

void frmNetworkAdapters::Design() {
  Caption = u"בחירת כרטיס רשת להתקנה...";
  Border = forms::BorderStyle::FixedDialog;
  MinimizeBox = false;
  BackColour = looks::kPaper;
  Move(0, 0, Px(520), Px(262));
  lstNICs.Clear();
  lstNICs.Description = u"כרטיסי רשת";
  lstNICs.TextFont = looks::kBody;
  lstNICs.Move(Px(18), Px(18), Px(484), Px(176));
  looks::LeadingButton(Command1, u"בחר");
  Command1.Move(Px(18), Px(212), Px(120), Px(32));
  looks::Button(cmdClose, u"סגור");
  cmdClose.Move(Px(382), Px(212), Px(120), Px(32));
}

void frmNetworkAdapters::Command1_Click() {
  Tag = DecimalText(lstNICs.ListIndex());
  Visible = false;
}

} // namespace quendra::provisioning
