#pragma once

#include "provisioning/ProvisioningFixture.h"
#include "provisioning/troubleshooter/Troubleshooter.h"

namespace quendra::provisioning {

/// The open dialog over a phone book with an entry for a line without a device that is known, one for PPPoE
/// and one for a VPN.
class TroubleshooterTest : public ProvisioningTest {
 protected:
  TroubleshooterTest() {
    machine.ras.AddEntry("Long").SetDevice("pppoe", "WAN Miniport (PPPOE)").SetLogin("long", "l");
    machine.ras.AddEntry("Home").SetDevice("pppoe", "pppoe").SetLogin("user@097", "secret");
    machine.ras.AddEntry("Away").SetDevice("vpn", "vpn").SetLogin("away", "a");
    machine.adapters.Cards = {"First card"};
  }

  void Open() { desktop.Show(form); }
  void Pick(const std::string& entry) {
    int row = 0;
    while (row < form.cmbDialups.ListCount() && form.cmbDialups.List(row) != FromUtf8(entry)) ++row;
    ASSERT_TRUE(desktop.ChooseItem(form.cmbDialups, row)) << entry;
  }
  void ClickCheck() { ASSERT_TRUE(desktop.Click(form.cmdCheck)); }
  /// A check of an entry without a dial.
  void Simulate(const std::string& entry, const char16_t* error) {
    Open();
    Pick(entry);
    form.txtEmunrateError.Value = Text(error);
    ClickCheck();
  }
  /// A check whose dial fails with this error, with all that follows.
  void FailWith(const std::string& entry, std::uint32_t error) {
    machine.ras.Dial(entry).ThenError(error);
    Open();
    Pick(entry);
    ClickCheck();
    desktop.RunUntilIdle();
  }
  /// The log's lines; each begins with a line break.
  std::vector<Text> Lines() const {
    std::vector<Text> lines;
    TextView rest = form.txtStatus.Value();
    while (rest.starts_with(u"\r\n")) {
      rest.remove_prefix(2);
      lines.emplace_back(rest.substr(0, rest.find(u"\r\n")));
      rest.remove_prefix(lines.back().size());
    }
    if (!rest.empty()) lines.push_back(u"no line: " + Text(rest));
    return lines;
  }
  /// Those that the diagnosis wrote, without those of the dial.
  std::vector<Text> Findings() const {
    std::vector<Text> findings = Lines();
    std::erase_if(findings, [](const Text& line) { return line.starts_with(u"פעולה: "); });
    return findings;
  }
  bool IsRed() const { return form.lblDiagnoze.ForeColour() == 255u; }
  bool HasEntry(const std::string& name) { return machine.ras.Entry(name) != nullptr; }
  std::vector<std::string> PingedAddresses() const {
    std::vector<std::string> addresses;
    for (const auto& echo : machine.icmp.Echoes) addresses.push_back(ToUtf8(echo.address.AsText()));
    return addresses;
  }
  static std::string EntryNameOf(const platform::simulated::SimulatedRemoteAccess::DialRequest& dial) {
    return platform::simulated::CutText(platform::simulated::TextOf(dial.params).substr(4));
  }

  frmConnectProb form{desktop, dun};
  diagnostics::mdlPing ping{machine.icmp};
  ModemLineCheck modemLineCheck{form, vpnAdapter, ping};
  ConnectionDiagnosis diagnosis{form, dun, modemLineCheck, desktop};
  Troubleshooter troubleshooter{form, dun, diagnosis};

  const Box error = TitledBox(u"שגיאה!", 0x10);
  const Box alreadyOpen{u"There is currently already a connection open.", 0x30,
                        u"  Connection Already Opened"};
  static constexpr const char16_t* kModemSilent = u"נראה שהמודם לא מתקשר עם המחשב - בודק חיבורים...";
  static constexpr const char16_t* kExchange = u"לא מצליח להתחבר למרכזיה של \"זלמר\" - צלצל 1-800-000-000";
};

} // namespace quendra::provisioning
