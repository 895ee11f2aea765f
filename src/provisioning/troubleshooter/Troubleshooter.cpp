#include "provisioning/troubleshooter/Troubleshooter.h"

#include "provisioning/remote_access/DialStateText.h"
#include "runtime/Format.h"

namespace quendra::provisioning {

Troubleshooter::Troubleshooter(frmConnectProb& form, mdlDun& dun, ConnectionDiagnosis& diagnosis)
    : form_(form), dun_(dun), diagnosis_(diagnosis) {
  form_.cmdCheck.Click = [this] { cmdCheck_Click(); };
  dun_.OnDialEvent = [this](std::uint32_t, std::uint32_t state, std::uint32_t error) {
    OnDialEvent(state, error);
  };
}

// A number to simulate has been treated by the time the button is disabled, so that it stays so until the
// form opens again.
void Troubleshooter::cmdCheck_Click() {
  diagnosis_.CurrentDialEntry = form_.PickedEntry();
  dun_.HangUpAllConnections();
  dun_.HangUpActive(kFalse16);
  if (form_.txtEmunrateError.Value().empty())
    Dial();
  else
    Diagnose(RoundToInt32(NumberOf(form_.txtEmunrateError.Value())));
  form_.cmdCheck.Enabled = false;
  ShowWaiting();
}

void Troubleshooter::OnDialEvent(std::uint32_t state, std::uint32_t error) {
  if (waiting_.size() < kMostWaiting) waiting_.push_back({state, error});
  if (!diagnosing_) ShowWaiting();
}

void Troubleshooter::Dial() {
  Text entry = diagnosis_.CurrentDialEntry;
  Text phoneNumber;
  Text userName;
  Text password;
  dun_.DialEntry(kTrue16, entry, phoneNumber, userName, password, form_.Window());
}

void Troubleshooter::Diagnose(std::int32_t error) {
  struct UnderWay {
    bool& flag;
    explicit UnderWay(bool& flag) : flag(flag) { flag = true; }
    ~UnderWay() { flag = false; }
  } const underWay(diagnosing_);
  diagnosis_.DiagnoseConnectionError(error);
}

void Troubleshooter::ShowWaiting() {
  while (!waiting_.empty()) {
    const DialEvent event = waiting_.front();
    waiting_.pop_front();
    if (form_.IsLoaded()) Show(event);
  }
}

void Troubleshooter::Show(DialEvent event) {
  const auto state = static_cast<std::int32_t>(event.state);
  form_.Append(u"פעולה: " + DecimalText(state) + u" - " + DialStateText(state));
  form_.RefreshStatus();
  if (event.error != 0) Diagnose(static_cast<std::int32_t>(event.error));
}

} // namespace quendra::provisioning
