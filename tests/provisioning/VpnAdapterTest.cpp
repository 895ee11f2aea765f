#include "provisioning/VpnAdapter.h"

#include "provisioning/ProvisioningFixture.h"

namespace quendra::provisioning {
namespace {

/// Gives a card its addresses, as the page for the first connection has it done.
class VpnAdapterSetUp : public ProvisioningTest {
 protected:
  void Configure() { vpnAdapter.ConfigureVpnAdapter(mainWindow, VpnAdapter::Steps::Silent); }
  int FaultOfConfiguring() {
    return FaultNumberOf([this] { Configure(); });
  }
  std::vector<std::string> Changes() const {
    std::vector<std::string> changes = CallsStartingWith("EnableStatic");
    for (const std::string& call : CallsStartingWith("SetGateways")) changes.push_back(call);
    return changes;
  }
  std::vector<Text> ListedCards() const {
    std::vector<Text> listed;
    for (int row = 0; row < cards.lstNICs.ListCount(); ++row) listed.push_back(cards.lstNICs.List(row));
    return listed;
  }
  static std::vector<std::string> ChangesOf(const std::string& card) {
    return {"EnableStatic " + card + " 10.200.1.1/255.0.0.0", "SetGateways " + card + " 10.0.0.138 metric 1"};
  }

  const Box nothingChosen = TitledBox(u"לא בחרת כרטיס רשת להגדרה!\r\nעליך להגדירו באופן ידני.", 0x20);
};

TEST_F(VpnAdapterSetUp, The_one_card_gets_its_addresses_without_a_question) {
  machine.adapters.Cards = {"First card"};

  Configure();

  EXPECT_EQ(Changes(), ChangesOf("First card"));
  EXPECT_EQ(desktop.CountOf("Show frmNetworkAdapters modal owner frmMenu"), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(VpnAdapterSetUp, Asks_the_management_of_this_machine_for_the_cards_that_have_addresses) {
  machine.adapters.Cards = {"First card"};

  Configure();

  ASSERT_GE(machine.Calls.size(), 2u);
  EXPECT_EQ(machine.Calls[0], "GetObject winmgmts:\\\\.\\root\\cimv2");
  EXPECT_EQ(machine.Calls[1],
            "ExecQuery Select * from Win32_NetworkAdapterConfiguration where IPEnabled=TRUE");
}

TEST_F(VpnAdapterSetUp, Of_several_cards_the_picked_one_gets_the_addresses) {
  machine.adapters.Cards = {"First card", "Second card", "Third card"};
  PickCard(1);

  Configure();

  EXPECT_EQ(Changes(), ChangesOf("Second card"));
  EXPECT_EQ(desktop.CountOf("Show frmNetworkAdapters modal owner frmMenu"), 1);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(VpnAdapterSetUp, Each_card_stands_in_the_list_by_its_description) {
  machine.adapters.Cards = {"First card", ToCodePage(u"כרטיס")};
  std::vector<Text> listed;
  WhileChoosing([&](frmNetworkAdapters&) { listed = ListedCards(); });

  Configure();

  EXPECT_EQ(listed, (std::vector<Text>{u"First card", u"כרטיס"}));
}

TEST_F(VpnAdapterSetUp, Who_closes_the_form_is_told_to_do_it_by_hand_and_no_card_is_changed) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([&](frmNetworkAdapters& form) { desktop.Click(form.cmdClose); });

  Configure();

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{nothingChosen});
  EXPECT_TRUE(Changes().empty());
}

TEST_F(VpnAdapterSetUp, The_close_box_of_the_form_picks_no_card_either) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([&](frmNetworkAdapters& form) { desktop.CloseBox(form); });

  Configure();

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{nothingChosen});
}

TEST_F(VpnAdapterSetUp, A_card_that_was_picked_before_is_not_taken_for_one_that_is_picked_now) {
  machine.adapters.Cards = {"First card", "Second card"};
  PickCard(1);
  Configure();
  machine.Calls.clear();
  WhileChoosing([&](frmNetworkAdapters& form) { desktop.Click(form.cmdClose); });

  Configure();

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{nothingChosen});
  EXPECT_TRUE(Changes().empty());
}

TEST_F(VpnAdapterSetUp, Without_a_card_the_call_on_none_fails) {
  EXPECT_EQ(FaultOfConfiguring(), 91);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(VpnAdapterSetUp, A_confirmation_without_a_row_fails_on_no_card) {
  machine.adapters.Cards = {"First card", "Second card"};
  PickCard(-1);

  EXPECT_EQ(FaultOfConfiguring(), 91);
  EXPECT_EQ(cards.Tag(), u"-1");
  EXPECT_TRUE(Changes().empty());
}

TEST_F(VpnAdapterSetUp, A_row_beyond_the_cards_fails_on_no_card) {
  machine.adapters.Cards = {"First card", "Second card"};
  PickCard(0);
  Configure();
  PickCard(3); // which the run before has left there

  EXPECT_EQ(FaultOfConfiguring(), 91);
}

TEST_F(VpnAdapterSetUp, A_choice_that_is_no_number_is_of_the_wrong_type) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([](frmNetworkAdapters& form) { form.Tag = u"First card"; });

  EXPECT_EQ(FaultOfConfiguring(), 13);
  EXPECT_TRUE(Changes().empty());
}

TEST_F(VpnAdapterSetUp, A_machine_without_such_management_fails_as_told) {
  machine.adapters.HasManagement = false;

  EXPECT_EQ(FaultOfConfiguring(), 429);
}

TEST_F(VpnAdapterSetUp, What_the_card_answers_is_not_looked_at) {
  machine.adapters.Cards = {"First card"};
  machine.adapters.Result = 66;

  Configure();

  EXPECT_EQ(Changes(), ChangesOf("First card"));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(VpnAdapterSetUp, Each_run_adds_to_the_list_while_the_form_stays_loaded) {
  machine.adapters.Cards = {"First card", "Second card"};
  PickCard(0);

  Configure();
  Configure();

  EXPECT_EQ(ListedCards(), (std::vector<Text>{u"First card", u"Second card", u"First card", u"Second card"}));
}

TEST_F(VpnAdapterSetUp, The_one_card_stands_in_the_list_too) {
  machine.adapters.Cards = {"First card"};

  Configure();
  Configure();

  EXPECT_EQ(ListedCards(), (std::vector<Text>{u"First card", u"First card"}));
}

TEST_F(VpnAdapterSetUp, A_form_that_was_closed_begins_with_an_empty_list) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([&](frmNetworkAdapters& form) { desktop.Click(form.cmdClose); });
  Configure();
  PickCard(0);

  Configure();

  EXPECT_EQ(ListedCards(), (std::vector<Text>{u"First card", u"Second card"}));
}

TEST_F(VpnAdapterSetUp, A_card_that_goes_while_the_form_stands_is_still_the_one_that_was_picked) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([&](frmNetworkAdapters& form) {
    machine.adapters.Cards = {"Another card"};
    form.lstNICs.SelectItem(1);
    desktop.Click(form.Command1);
  });

  Configure();

  EXPECT_EQ(Changes(), ChangesOf("Second card"));
}

TEST_F(VpnAdapterSetUp, Tells_its_three_steps_where_asked_to_with_plain_boxes) {
  machine.adapters.Cards = {"First card"};
  std::vector<std::string> callsAtBoxes;
  desktop.OnBox = [&] {
    callsAtBoxes.push_back(machine.Calls.empty() ? "" : machine.Calls.back().substr(0, 9));
  };

  vpnAdapter.ConfigureVpnAdapter(mainWindow, VpnAdapter::Steps::Told);

  EXPECT_EQ(desktop.Boxes, std::vector<Box>(3, Box{u"OK", 0, u"Quendra"}));
  EXPECT_EQ(callsAtBoxes, (std::vector<std::string>{"", "GetObject", "ExecQuery"}));
  EXPECT_EQ(Changes(), ChangesOf("First card"));
}

} // namespace
} // namespace quendra::provisioning
