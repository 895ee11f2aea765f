#include "app/ConnectionWing.h"

#include "shell/ProgramFixture.h"

// The page for the first connection, its dialogs and what they do to the machine, in the whole program.

namespace quendra::app {
namespace {

using Box = forms::headless::HeadlessDesktop::Box;
using platform::RasEntry;

Box TitledBox(const char16_t* text, int icon) { return {text, icon | 0x180000, u"זלמר בינלאומי@נט"}; }
const Box kSuccess = TitledBox(u"החייגן נוצר בהצלחה.", 0x40);

class FirstConnection : public shell::ProgramTest {
 protected:
  FirstConnection() {
    machine.ras.UseLoop(desktop);
    machine.ras.Devices = {{"pppoe", "pppoe"}, {"vpn", "vpn"}};
    machine.adapters.Cards = {"First card"};
  }

  void OpenPage() {
    ComeHome();
    ClickEntry(2);
  }
  /// The step of the connection, filled in up to the click on its button.
  void FillIn(std::size_t modem) {
    OpenPage();
    ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblCaption[1]));
    ASSERT_TRUE(desktop.Type(page.connection.frsCon_txtUsername, u"dana"));
    ASSERT_TRUE(desktop.Type(page.connection.frsCon_txtPassword, u"Secret"));
    ASSERT_TRUE(desktop.Click(page.connection.frsCon_lblModems[modem]));
  }
  void Create(std::size_t modem) {
    FillIn(modem);
    ASSERT_TRUE(desktop.Click(page.connection.frsCon_cmdCreate));
  }
  std::string CardChanges() const {
    std::string changes;
    for (const std::string& call : machine.Calls)
      if (call.starts_with("EnableStatic") || call.starts_with("SetGateways")) changes += call + "\n";
    return changes;
  }

  /// The dialog over a phone book of two entries.
  void OpenDialog() {
    machine.ras.AddEntry("097").SetDevice("pppoe", "pppoe").SetLogin("dana@097", "secret");
    machine.ras.AddEntry("Office").SetDevice("vpn", "vpn");
    OpenPage();
    ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblConnectProb));
    ASSERT_TRUE(dialog.Visible());
    ASSERT_TRUE(desktop.ChooseItem(dialog.cmbDialups, 0));
  }
  void Check() {
    ASSERT_TRUE(desktop.Click(dialog.cmdCheck));
    desktop.RunUntilIdle();
  }

  provisioning::FirstConnectionPage& page = program.firstConnectionPage;
  provisioning::frmConnectProb& dialog = program.connection.frmConnectProb;
  provisioning::frmNetworkAdapters& cards = program.connection.frmNetworkAdapters;
};

/// What the phone book holds afterwards, by modem.
struct ModemCase {
  std::size_t modem;
  std::uint32_t options;
  std::uint32_t entryType;
  std::uint32_t strategy;
  const char* device;
  const char* server;
};
class EachModem : public FirstConnection, public testing::WithParamInterface<ModemCase> {};

TEST_P(EachModem, Leaves_one_entry_in_the_phone_book_and_leads_on_to_the_mail_step) {
  const ModemCase& expected = GetParam();

  Create(expected.modem);

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kSuccess});
  ASSERT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"097"});
  const auto& entry = *machine.ras.Entry("097");
  EXPECT_EQ(entry.Number(RasEntry::kOptions), expected.options);
  EXPECT_EQ(entry.Number(RasEntry::kEntryType), expected.entryType);
  EXPECT_EQ(entry.Number(RasEntry::kVpnStrategy), expected.strategy);
  EXPECT_EQ(entry.DeviceType(), expected.device);
  EXPECT_EQ(entry.DeviceName(), expected.device);
  EXPECT_EQ(entry.TextOf(RasEntry::kLocalPhoneNumber, RasEntry::kLocalPhoneNumberBytes), expected.server);
  EXPECT_EQ(entry.userName, "dana@097");
  EXPECT_EQ(entry.password, "secret");
  EXPECT_EQ(CardChanges().empty(), std::string(expected.device) != "vpn");
  EXPECT_FALSE(page.connection.frsCon_Frame1.Visible());
  EXPECT_TRUE(page.mail.frsCon_Frame2.Visible());
  EXPECT_EQ(page.mail.frsCon_txtEmailUN.Value(), u"dana");
}

INSTANTIATE_TEST_SUITE_P(Modems, EachModem,
                         testing::Values(ModemCase{0, 0x0500021F, 5, 0, "pppoe", ""},
                                         ModemCase{1, 0x0500021F, 5, 0, "pppoe", ""},
                                         ModemCase{2, 0x7FBEFFFF, 2, 1, "vpn", "10.0.0.138"},
                                         ModemCase{3, 0x0500021F, 5, 0, "pppoe", ""},
                                         ModemCase{4, 0x051C0310, 5, 0, "pppoe", ""}),
                         [](const auto& row) { return "Modem" + std::to_string(row.param.modem); });

TEST_F(FirstConnection, The_pages_button_is_disabled_while_the_connection_is_made) {
  FillIn(0);
  bool enabled = true;
  desktop.OnBox = [&] { enabled = page.connection.frsCon_cmdCreate.Enabled(); };

  ASSERT_TRUE(desktop.Click(page.connection.frsCon_cmdCreate));

  EXPECT_FALSE(enabled);
  EXPECT_TRUE(page.connection.frsCon_cmdCreate.Enabled());
}

TEST_F(FirstConnection, The_button_that_stayed_enabled_without_a_modem_writes_an_empty_record) {
  machine.ras.AddEntry("097").SetDevice("vpn", "vpn").SetLogin("old", "old");
  FillIn(2);
  ClickEntry(1);
  ClickEntry(2);

  ASSERT_TRUE(desktop.Click(page.connection.frsCon_cmdCreate));

  std::vector<std::uint8_t> emptyRecord(RasEntry::kBytes);
  PutLittle32(emptyRecord, 0, RasEntry::kBytes);
  const auto& entry = *machine.ras.Entry("097");
  EXPECT_EQ(entry.properties, emptyRecord);
  EXPECT_EQ(entry.userName, "");
  EXPECT_EQ(entry.password, "");
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kSuccess});
}

TEST_F(FirstConnection, The_program_may_end_while_the_box_of_success_stands) {
  desktop.OnBox = [&] { desktop.CloseBox(program.frmMenu); };

  Create(0);

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kSuccess});
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
}

TEST_F(FirstConnection, The_card_of_the_vpn_modem_gets_its_addresses) {
  Create(2);

  EXPECT_EQ(CardChanges(), "EnableStatic First card 10.200.1.1/255.0.0.0\n"
                           "SetGateways First card 10.0.0.138 metric 1\n");
}

TEST_F(FirstConnection, The_user_picks_one_of_several_cards_over_the_main_window) {
  machine.adapters.Cards = {"First card", "Second card"};
  desktop.OnModal = [&](forms::Form& form) {
    ASSERT_EQ(&form, &cards);
    cards.lstNICs.SelectItem(1);
    EXPECT_TRUE(desktop.Click(cards.Command1));
  };

  Create(2);

  EXPECT_EQ(desktop.CountOf("Show frmNetworkAdapters modal owner frmMenu"), 1);
  EXPECT_NE(CardChanges().find("EnableStatic Second card"), std::string::npos);
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kSuccess});
}

TEST_F(FirstConnection,
       A_page_that_is_left_while_a_card_is_picked_goes_on_hidden_and_opens_at_the_mail_step) {
  machine.adapters.Cards = {"First card", "Second card"};
  desktop.OnModal = [&](forms::Form&) {
    program.frmMenu.lblCaption[1].Click();
    EXPECT_FALSE(page.frameFirstConnection.Visible());
    cards.lstNICs.SelectItem(0);
    desktop.Click(cards.Command1);
  };

  Create(2);

  EXPECT_FALSE(page.frameFirstConnection.Visible());
  EXPECT_TRUE(program.surfPage.frameSurfProb.Visible());
  EXPECT_NE(machine.ras.Entry("097"), nullptr);
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kSuccess});
  desktop.OnModal = nullptr;
  ClickEntry(2);
  EXPECT_TRUE(page.mail.frsCon_Frame2.IsShown());
}

TEST_F(FirstConnection, The_main_window_that_closes_while_a_card_is_picked_ends_the_program) {
  machine.adapters.Cards = {"First card", "Second card"};
  desktop.OnModal = [&](forms::Form&) { desktop.CloseBox(program.frmMenu); };

  Create(2);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_EQ(machine.ras.Entry("097"), nullptr);
}

TEST_F(FirstConnection, Without_a_network_card_the_vpn_modem_ends_the_program_with_the_run_times_message) {
  machine.adapters.Cards.clear();

  Create(2);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_EQ(desktop.Boxes[0].text, u"Run-time error '91':\n\nObject variable or With block variable not set");
}

TEST_F(FirstConnection, The_mail_account_follows_the_connection) {
  Create(0);
  ASSERT_TRUE(desktop.Click(page.mail.frsCon_lblMails[0]));
  ASSERT_TRUE(desktop.Type(page.mail.frsCon_txtFullName, u"Dana"));

  ASSERT_TRUE(desktop.Click(page.mail.frsCon_cmdCreateEmail));

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1], TitledBox(u"חשבון דואר אלקטרוני נוצר בהצלחה.", 0x40));
  EXPECT_FALSE(machine.registry.Calls.empty());
}

TEST_F(FirstConnection, The_opened_page_shows_the_mail_programs_of_the_machine) {
  OpenPage();
  ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblCaption[0]));

  EXPECT_TRUE(page.mail.frsCon_lblMailsBG[0].IsShown());
  EXPECT_FALSE(page.mail.frsCon_lblMailsBG[1].IsShown());
}

TEST_F(FirstConnection, The_password_stands_in_no_call_of_the_machine_but_the_phone_books) {
  Create(4);

  for (const std::string& call : machine.Calls) EXPECT_EQ(call.find("secret"), std::string::npos) << call;
  for (const std::string& call : machine.registry.Calls)
    EXPECT_EQ(call.find("secret"), std::string::npos) << call;
}

// The dialog for connection problems.

TEST_F(FirstConnection, The_link_on_the_menu_opens_the_dialog_over_the_main_window) {
  OpenDialog();

  EXPECT_EQ(desktop.CountOf("Show frmConnectProb modal owner frmMenu"), 1);
}

TEST_F(FirstConnection, A_real_refusal_ends_at_the_connection_that_is_still_open) {
  machine.ras.Dial("097").Then(0).Then(5).ThenError(691);
  OpenDialog();

  Check();

  EXPECT_EQ(dialog.txtStatus.Value(), u"\r\nפעולה: 0 - פותח פורט תקשורת\r\nפעולה: 5 - מאמת שם משתמש וסיסמא"
                                      u"\r\nפעולה: 5 - מאמת שם משתמש וסיסמא\r\nמנסה חיבור לזלמר...");
  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_EQ(desktop.Boxes[0].text, u"There is currently already a connection open.");
  EXPECT_NE(machine.ras.Entry("097tmp"), nullptr);
  EXPECT_TRUE(dialog.cmdCheck.Enabled());
}

TEST_F(FirstConnection, A_simulated_refusal_leaves_the_test_entry_and_the_button_disabled) {
  OpenDialog();
  dialog.txtEmunrateError.Value = u"691";

  Check();

  EXPECT_TRUE(desktop.Boxes.empty());
  ASSERT_NE(machine.ras.Entry("097tmp"), nullptr);
  EXPECT_EQ(machine.ras.Entry("097tmp")->userName, "1@1");
  EXPECT_EQ(machine.ras.Entry("097tmp")->password, "secret");
  EXPECT_FALSE(dialog.cmdCheck.Enabled());
}

TEST_F(FirstConnection, The_dialog_picks_a_card_over_itself) {
  machine.adapters.Cards = {"First card", "Second card"};
  OpenDialog();
  desktop.ChooseItem(dialog.cmbDialups, 1);
  dialog.txtEmunrateError.Value = u"678";
  desktop.OnModal = [&](forms::Form&) { desktop.Click(cards.cmdClose); };

  Check();

  EXPECT_EQ(desktop.CountOf("Show frmNetworkAdapters modal owner frmConnectProb"), 1);
  EXPECT_EQ(desktop.Boxes.size(), 4u);
}

TEST_F(FirstConnection, A_dial_goes_with_its_dialog) {
  machine.ras.Dial("097").Then(0).Then(5).ThenError(691);
  OpenDialog();
  ASSERT_TRUE(desktop.Click(dialog.cmdCheck));
  desktop.PumpOnce();

  ASSERT_TRUE(desktop.Click(dialog.Command1));
  desktop.RunUntilIdle();

  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(FirstConnection, The_program_may_end_while_the_diagnosis_stands_in_a_box) {
  OpenDialog();
  desktop.ChooseItem(dialog.cmbDialups, 1);
  dialog.txtEmunrateError.Value = u"678";
  desktop.OnBox = [&] { desktop.CloseBox(program.frmMenu); };

  Check();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
}

TEST_F(FirstConnection, Two_programs_know_nothing_of_each_others_entry_under_check) {
  platform::simulated::SimulatedMachine otherMachine;
  forms::headless::HeadlessDesktop otherDesktop;
  const Program other(otherMachine.Operations(), otherDesktop);
  machine.ras.Dial("097").Then(0);
  OpenDialog();

  Check();

  EXPECT_EQ(program.connection.connectionDiagnosis.CurrentDialEntry, u"097");
  EXPECT_EQ(other.connection.connectionDiagnosis.CurrentDialEntry, u"");
}

} // namespace
} // namespace quendra::app
