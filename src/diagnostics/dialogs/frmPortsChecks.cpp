#include "diagnostics/dialogs/frmPortsChecks.h"

#include "diagnostics/ProbeTexts.h"
#include "foundation/Looks.h"
#include "runtime/Format.h"
#include "runtime/Integers.h"
#include "runtime/Settings.h"

namespace quendra::diagnostics {

namespace looks = foundation::looks;
using foundation::Px;

frmPortsChecks::frmPortsChecks(forms::FormHost& forms, foundation::modSocketPlus& module)
    : Form(u"frmPortsChecks"), forms_(forms),
      module_(module), probes_{{{settings::ProbeWebHost, kWebPort, kWebRequest, Label3},
                                {settings::IspMailHost, kOutgoingMailPort, kOutgoingMailRequest, Label4},
                                {settings::IspMailHost, kIncomingMailPort, kIncomingMailRequest, Label6}}} {
  Command1.Click = [this] { Command1_Click(); };
  Command2.Click = [this] { forms_.Unload(*this); };
  Default = &Command1;
  Cancel = &Command2;
}

void frmPortsChecks::Design() {
  Caption = u"בדיקת פורטים";
  Border = forms::BorderStyle::FixedDialog;
  MinimizeBox = false;
  BackColour = looks::kPaper;
  Move(0, 0, Px(670), Px(196));
  struct Line {
    forms::Label& port;
    const char16_t* caption;
    forms::Label& result;
  };
  int top = Px(18);
  for (const Line& line :
       {Line{Label1, u"פורט 80 (גלישה/HTTP):", Label3}, Line{Label2, u"פורט 25 (דואר/SMTP):", Label4},
        Line{Label5, u"פורט 110 (דואר/POP3):", Label6}}) {
    looks::PlainText(line.port, line.caption, looks::kBody);
    line.port.Move(Px(18), top, Px(190), Px(24));
    looks::PlainText(line.result, u"", looks::kStrong);
    line.result.Move(Px(214), top, Px(440), Px(24)); // the longest error
    line.result.Tag = Text();
    top += Px(38);
  }
  looks::Button(Command1, u"בדוק...");
  Command1.Move(Px(18), Px(146), Px(120), Px(32));
  looks::Button(Command2, u"סגור");
  Command2.Move(Px(532), Px(146), Px(120), Px(32));
}

void frmPortsChecks::Form_Load() {
  PrepareSockets();
  Command1_Click();
}

void frmPortsChecks::Command1_Click() {
  ReleaseSockets();
  PrepareSockets();
  std::int16_t index = 0;
  for (const Probe& probe : probes_) {
    probe.result.Tag = u"0";
    spSockets_->Connect(++index, Text(probe.host), probe.port);
  }
}

void frmPortsChecks::PrepareSockets() {
  spSockets_ = std::make_shared<foundation::CSocketPlus>(module_);
  for (std::int16_t index = 1; index <= static_cast<std::int16_t>(probes_.size()); ++index)
    spSockets_->ArrayAdd(index);
  auto& events = spSockets_->Events;
  events.Connect = [this](Index index) { spSockets_Connect(index); };
  events.DataArrival = [this](Index index, std::int32_t bytesTotal) {
    spSockets_DataArrival(index, bytesTotal);
  };
  events.CloseSck = [this](Index index) { spSockets_->CloseSck(index); };
  events.Error = [this](Index index, std::int16_t number, const Text& description, std::int32_t, const Text&,
                        const Text&, std::int32_t, bool&) { spSockets_Error(index, number, description); };
}

void frmPortsChecks::ReleaseSockets() {
  if (!spSockets_) return;
  const std::int32_t count = spSockets_->ArrayCount();
  for (std::int32_t index = 0; index <= count; ++index)
    if (spSockets_->ArrayIndexInUse(index)) spSockets_->ArrayRemove(index);
  spSockets_->Release();
  spSockets_.reset();
}

const frmPortsChecks::Probe* frmPortsChecks::ProbeOf(Index index) const {
  const auto place = static_cast<std::size_t>(index.AsInt32() - 1);
  return place < probes_.size() ? &probes_[place] : nullptr;
}

void frmPortsChecks::spSockets_Connect(Index index) {
  if (const Probe* probe = ProbeOf(index)) spSockets_->SendData(index, probe->request);
}

// `bytesTotal` is all that waits in the socket, and nothing takes it: a reply in several pieces counts the
// first ones again.
void frmPortsChecks::spSockets_DataArrival(Index index, std::int32_t bytesTotal) {
  const Probe* probe = ProbeOf(index);
  if (!probe) return;
  probe->result.Tag = NumberText(NumberOf(probe->result.Tag()) + bytesTotal / 1024.0);
  probe->result.Caption = u"OK! (" + Format(NumberOf(probe->result.Tag()), u"####0.00") + u" KB)";
  probe->result.ForeColour = forms::kGreen;
  if (spSockets_->State(index) == foundation::sckClosed) spSockets_->CloseSck(index);
}

void frmPortsChecks::spSockets_Error(Index index, std::int16_t number, const Text& description) {
  if (const Probe* probe = ProbeOf(index)) {
    probe->result.Caption = u"ERROR: " + DecimalText(number) + u" - " + description;
    probe->result.Tag = u"0";
    probe->result.ForeColour = forms::kRed;
  }
  spSockets_->CloseSck(index);
}

} // namespace quendra::diagnostics
