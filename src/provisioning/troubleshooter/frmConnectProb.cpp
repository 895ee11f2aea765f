#include "provisioning/troubleshooter/frmConnectProb.h"

#include "provisioning/Boxes.h"
#include "runtime/Fault.h"

namespace quendra::provisioning {

frmConnectProb::frmConnectProb(forms::Desktop& desktop, mdlDun& dun)
    : Form(u"frmConnectProb"), desktop_(desktop), dun_(dun) {
  Command1.Click = [this] { desktop_.Unload(*this); };
  Cancel = &Command1;
}

void frmConnectProb::Form_Load() {
  Text own;
  if (dun_.EnumEntries(entries_, entryCount_, own) == kFalse16) {
    TellFailure(desktop_, u"נכשל!");
    return;
  }
  for (const Text& entry : entries_) cmbDialups.AddItem(entry);
}

void frmConnectProb::Form_Unload() {
  dun_.UnhookDialEvents(Window());
  dun_.HangUpAllConnections();
  dun_.HangUpActive(kFalse16);
}

const Text& frmConnectProb::PickedEntry() const {
  const auto place = static_cast<std::size_t>(cmbDialups.ListIndex());
  if (place >= entries_.size()) throw Fault(Fault::kSubscript);
  return entries_[place];
}

void frmConnectProb::Append(TextView line) {
  txtStatus.Value = txtStatus.Value() + u"\r\n" + Text(line);
  txtStatus.SelStart = static_cast<int>(txtStatus.Value().size());
}

void frmConnectProb::Diagnose(const char16_t* diagnosis) {
  lblDiagnoze.ForeColour = forms::kRed;
  lblDiagnoze.Caption = Text(diagnosis);
}

} // namespace quendra::provisioning
