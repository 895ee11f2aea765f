#pragma once

#include "provisioning/ConnectionCreation.h"
#include "provisioning/ProvisioningFixture.h"

namespace quendra::provisioning {

/// A page with nothing on it but what the making of a connection works on.
class PlainPage : public forms::Form {
 public:
  PlainPage() : Form(u"page") {
    // As the page does it, where a modem is chosen and nothing stays empty.
    frsCon_txtUsername.Change = frsCon_txtPassword.Change = [this] { frsCon_cmdCreate.Enabled = true; };
    frsCon_Frame2.Visible = false;
  }
  void Design() override {}

  std::int16_t SelectedModem = 0;
  forms::TextBox frsCon_txtUsername{*this, u"frsCon_txtUsername"};
  forms::TextBox frsCon_txtPassword{*this, u"frsCon_txtPassword"};
  forms::CommandButton frsCon_cmdCreate{*this, u"frsCon_cmdCreate"};
  forms::Label frsCon_lblError0{*this, u"frsCon_lblError(0)"};
  forms::Label frsCon_lblError1{*this, u"frsCon_lblError(1)"};
  forms::Frame frsCon_Frame1{*this, u"frsCon_Frame1"};
  forms::Frame frsCon_Frame2{*this, u"frsCon_Frame2"};
  forms::TextBox frsCon_txtEmailUN{*this, u"frsCon_txtEmailUN"};

  ConnectionStep Step() {
    return {SelectedModem,
            frsCon_txtUsername,
            frsCon_txtPassword,
            frsCon_cmdCreate,
            {&frsCon_lblError0, &frsCon_lblError1},
            frsCon_Frame1,
            frsCon_Frame2,
            frsCon_txtEmailUN};
  }
};

class ConnectionCreationTest : public ProvisioningTest {
 protected:
  /// What the subscriber fills in, with the click that follows.
  void Create(std::int16_t modem, const char16_t* userName = u"user", const char16_t* password = u"secret") {
    page.SelectedModem = modem;
    page.frsCon_txtUsername.Value = Text(userName);
    page.frsCon_txtPassword.Value = Text(password);
    creation.CreateConnection();
  }
  bool HasEntry(const std::string& name) { return machine.ras.Entry(name) != nullptr; }
  bool WentOnToMail() const { return !page.frsCon_Frame1.Visible() && page.frsCon_Frame2.Visible(); }

  PlainPage page;
  ConnectionCreation creation{dun, vpnAdapter, desktop, page.Step()};

  const Box success = TitledBox(u"החייגן נוצר בהצלחה.", 0x40);
  const Box failure = TitledBox(u"נכשל!", 0x10);
};

} // namespace quendra::provisioning
