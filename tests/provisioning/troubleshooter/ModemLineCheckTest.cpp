#include "provisioning/troubleshooter/ModemLineCheck.h"

#include "provisioning/troubleshooter/TroubleshooterFixture.h"

namespace quendra::provisioning {
namespace {

/// What becomes of the numbers 633 and 678.
class ModemLine : public TroubleshooterTest {
 protected:
  const std::vector<std::string> allAddresses{"10.0.0.138", "192.168.0.1", "10.0.0.1"};
};

TEST_F(ModemLine, Both_numbers_lead_here) {
  for (const char16_t* number : {u"633", u"678"}) {
    machine.icmp.Echoes.clear();
    Simulate("Home", number);
    EXPECT_EQ(Findings().at(0), u"שגיאה: " + Text(number) + u" - מטפל...");
    EXPECT_EQ(PingedAddresses(), allAddresses);
    desktop.Click(form.Command1);
  }
}

TEST_F(ModemLine, A_modem_that_answers_at_the_second_address_is_all_right) {
  machine.icmp.RouteTo("192.168.0.1").Target();

  FailWith("Home", 633);

  EXPECT_EQ(Findings(),
            (std::vector<Text>{u"שגיאה: 633 - מטפל...", u"פינג ל-10.0.0.138 - Request Timed Out",
                               u"פינג תקין ל-192.168.0.1", u"פינג ל-10.0.0.1 - Request Timed Out"}));
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
  EXPECT_FALSE(IsRed());
  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(ModemLine, All_three_addresses_are_asked_after_a_success_too) {
  machine.icmp.RouteTo("10.0.0.138").Target();

  Simulate("Home", u"678");

  EXPECT_EQ(PingedAddresses(), allAddresses);
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
}

TEST_F(ModemLine, A_modem_that_answers_nowhere_is_told_in_red) {
  FailWith("Home", 678);

  EXPECT_EQ(form.lblDiagnoze.Caption(), kModemSilent);
  EXPECT_TRUE(IsRed());
}

TEST_F(ModemLine, An_unreachable_host_has_its_own_line) {
  machine.icmp.RouteTo("10.0.0.1").TargetWithStatus(11003);

  Simulate("Home", u"678");

  EXPECT_EQ(Findings().at(3), u"פינג ל-10.0.0.1 - Destination Host Unreachable");
  EXPECT_TRUE(IsRed());
}

TEST_F(ModemLine, Any_other_status_has_no_line) {
  machine.icmp.RouteTo("10.0.0.138").TargetWithStatus(11002);
  machine.icmp.RouteTo("192.168.0.1").TargetWithStatus(11050);

  Simulate("Home", u"678");

  EXPECT_EQ(Findings(), (std::vector<Text>{u"שגיאה: 678 - מטפל...", u"פינג ל-10.0.0.1 - Request Timed Out"}));
  EXPECT_EQ(form.lblDiagnoze.Caption(), kModemSilent);
}

TEST_F(ModemLine, A_machine_that_sends_no_echoes_has_no_lines) {
  machine.icmp.FailHandle = true;

  Simulate("Home", u"678");

  EXPECT_EQ(Findings(), std::vector<Text>{u"שגיאה: 678 - מטפל..."});
  EXPECT_EQ(form.lblDiagnoze.Caption(), kModemSilent);
}

TEST_F(ModemLine, An_entry_whose_device_has_a_long_name_is_told_silent_without_an_echo) {
  FailWith("Long", 678);

  EXPECT_TRUE(machine.icmp.Echoes.empty());
  EXPECT_EQ(Findings(), std::vector<Text>{u"שגיאה: 678 - מטפל..."});
  EXPECT_EQ(form.lblDiagnoze.Caption(), kModemSilent);
  EXPECT_TRUE(IsRed());
  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(ModemLine, The_devices_name_counts_with_its_case_and_not_its_type) {
  for (const char* name : {"PPPoE", "Vpn", "pppoe ", "vpn2", ""}) {
    machine.ras.Entry("Home")->SetDevice("pppoe", name);
    Simulate("Home", u"678");
    EXPECT_TRUE(machine.icmp.Echoes.empty()) << name;
    EXPECT_TRUE(desktop.Boxes.empty()) << name;
    desktop.Click(form.Command1);
  }
}

TEST_F(ModemLine, The_connection_is_hung_up_first) {
  FailWith("Home", 678);

  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(dun.ActiveRasConn, platform::kNoRasConnection);
}

TEST_F(ModemLine, An_entry_that_is_gone_is_told_by_the_layer_and_the_form_and_asks_nobody) {
  machine.ras.Dial("Home").Meanwhile([&] { machine.ras.RemoveEntry("Home"); }).ThenError(678);
  Open();
  Pick("Home");

  ClickCheck();
  desktop.RunUntilIdle();

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_EQ(desktop.Boxes[1], error);
  EXPECT_TRUE(machine.icmp.Echoes.empty());
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
  EXPECT_TRUE(form.cmdCheck.Enabled());
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"");
}

TEST_F(ModemLine, A_vpn_has_its_card_set_up_with_three_boxes_before_the_echoes) {
  std::vector<std::size_t> echoesAtBoxes;
  desktop.OnBox = [&] { echoesAtBoxes.push_back(machine.icmp.Echoes.size()); };

  FailWith("Away", 678);

  EXPECT_EQ(desktop.Boxes, std::vector<Box>(3, Box{u"OK", 0, u"Quendra"}));
  EXPECT_EQ(echoesAtBoxes, (std::vector<std::size_t>{0, 0, 0}));
  EXPECT_EQ(CallsStartingWith("EnableStatic"),
            std::vector<std::string>{"EnableStatic First card 10.200.1.1/255.0.0.0"});
  EXPECT_EQ(CallsStartingWith("SetGateways"),
            std::vector<std::string>{"SetGateways First card 10.0.0.138 metric 1"});
  EXPECT_EQ(PingedAddresses(), allAddresses);
}

TEST_F(ModemLine, A_declined_card_is_told_and_the_echoes_follow) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([&](frmNetworkAdapters& choice) { desktop.Click(choice.cmdClose); });

  FailWith("Away", 678);

  ASSERT_EQ(desktop.Boxes.size(), 4u);
  EXPECT_EQ(desktop.Boxes[3], TitledBox(u"לא בחרת כרטיס רשת להגדרה!\r\nעליך להגדירו באופן ידני.", 0x20));
  EXPECT_EQ(desktop.CountOf("Show frmNetworkAdapters modal owner frmConnectProb"), 1);
  EXPECT_EQ(PingedAddresses(), allAddresses);
}

TEST_F(ModemLine, A_vpn_on_a_machine_without_a_card_ends_the_program) {
  machine.adapters.Cards.clear();

  FailWith("Away", 678);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(ModemLine, Three_silent_addresses_take_three_time_limits) {
  const std::uint32_t before = machine.system.GetTickCount();

  Simulate("Home", u"678");

  EXPECT_EQ(machine.system.GetTickCount() - before, 3000u);
}

} // namespace
} // namespace quendra::provisioning
