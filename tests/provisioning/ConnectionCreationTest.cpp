#include "provisioning/ConnectionCreation.h"

#include "provisioning/ConnectionCreationFixture.h"

namespace quendra::provisioning {
namespace {

using platform::RasEntry;

/// A number of the record by its place.
struct NumberAt {
  std::size_t at;
  std::uint32_t number;
};

/// The record in which these numbers stand and nothing else but the texts that every entry has.
std::vector<std::uint8_t> RecordOf(std::initializer_list<NumberAt> numbers, const std::string& device,
                                   const std::string& server) {
  std::vector<std::uint8_t> record(2088);
  PutLittle32(record, 0, 2088);
  for (const NumberAt& row : numbers) PutLittle32(record, row.at, row.number);
  std::copy(server.begin(), server.end(), record.begin() + 27);
  std::copy(device.begin(), device.end(), record.begin() + 972);
  std::copy(device.begin(), device.end(), record.begin() + 989);
  return record;
}
std::vector<std::uint8_t> PppoeRecord(std::uint32_t options = 0x0500021F) {
  return RecordOf({{4, options},
                   {8, 972},
                   {12, 972},
                   {184, 4},
                   {188, 1},
                   {1768, 1},
                   {1772, 1},
                   {1776, 75},
                   {1780, 120},
                   {1784, 120},
                   {1796, 5},
                   {1800, 3}},
                  "pppoe", "");
}
std::vector<std::uint8_t> VpnRecord() {
  return RecordOf({{4, 0x7FBEFFFF},
                   {8, 972},
                   {12, 972},
                   {184, 4},
                   {188, 1},
                   {1768, 1},
                   {1772, 1},
                   {1776, 75},
                   {1780, 120},
                   {1784, 120},
                   {1796, 2},
                   {1800, 3},
                   {2084, 1}},
                  "vpn", "10.0.0.138");
}

using Creation = ConnectionCreationTest;

TEST_F(Creation, The_pppoe_modems_make_this_very_entry) {
  for (const std::int16_t modem : {0, 1, 3}) {
    machine.ras.RemoveEntry("097");
    Create(modem);
    ASSERT_TRUE(HasEntry("097")) << modem;
    EXPECT_EQ(machine.ras.Entry("097")->properties, PppoeRecord()) << modem;
  }
}

TEST_F(Creation, The_vpn_modem_makes_this_very_entry) {
  machine.adapters.Cards = {"First card"};

  Create(2);

  ASSERT_TRUE(HasEntry("097"));
  EXPECT_EQ(machine.ras.Entry("097")->properties, VpnRecord());
  EXPECT_EQ(CallsStartingWith("EnableStatic").size(), 1u);
}

TEST_F(Creation, The_copied_entry_differs_in_its_options_alone) {
  Create(4);

  ASSERT_TRUE(HasEntry("097"));
  EXPECT_EQ(machine.ras.Entry("097")->properties, PppoeRecord(0x051C0310));
}

TEST_F(Creation, User_name_and_password_are_saved_for_the_dial_and_nothing_else_is) {
  for (const std::int16_t modem : {0, 4}) {
    Create(modem, u"user", u"secret");
    const auto& entry = *machine.ras.Entry("097");
    EXPECT_EQ(entry.userName, "user@097") << modem;
    EXPECT_EQ(entry.password, "secret") << modem;
    EXPECT_EQ(entry.phoneNumber + entry.callbackNumber + entry.domain, "") << modem;
  }
}

TEST_F(Creation, The_user_name_gets_the_realm_that_it_lacks) {
  const struct {
    const char16_t* typed;
    const char16_t* made;
  } names[] = {
      {u"USER", u"user@097"},
      {u"user@097", u"user@097"},
      {u"User@097", u"user@097"},
      {u"user@izelmar", u"user@IZelmar"},
      {u"USER@IZELMAR", u"user@IZelmar"},
      {u"uSeR@iZeLmAr.net", u"user@IZelmar.net"},
      {u"user@izelmar@izelmar", u"user@IZelmar@IZelmar"},
      {u"user@097@izelmar", u"user@097@IZelmar"},
      {u"user@elsewhere", u"user@elsewhere@097"},
      {u"user@0970", u"user@0970"},
      {u"097", u"097@097"},
      {u"", u"@097"},
  };
  for (const auto& name : names) {
    Create(0, name.typed);
    EXPECT_EQ(page.frsCon_txtUsername.Value(), name.made);
    EXPECT_EQ(machine.ras.Entry("097")->userName, ToUtf8(name.made));
  }
}

TEST_F(Creation, A_password_in_capitals_is_stored_in_small_letters) {
  Create(0, u"user", u"SeCrEt1");

  EXPECT_EQ(page.frsCon_txtPassword.Value(), u"secret1");
  EXPECT_EQ(machine.ras.Entry("097")->password, "secret1");
}

TEST_F(Creation, Success_is_told_and_leads_on_to_the_mail_step) {
  Create(0, u"User.Name");

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{success});
  EXPECT_TRUE(WentOnToMail());
  EXPECT_EQ(page.frsCon_txtEmailUN.Value(), u"user.name");
}

TEST_F(Creation, The_mail_step_comes_after_the_box_of_success) {
  bool wentOn = true;
  desktop.OnBox = [&] { wentOn = WentOnToMail() || !page.frsCon_txtEmailUN.Value().empty(); };

  Create(0);

  EXPECT_FALSE(wentOn);
}

TEST_F(Creation, The_name_for_mail_ends_at_the_first_at_sign) {
  for (const auto& [typed, mail] : {std::pair{u"a@b@izelmar", u"a"}, std::pair{u"@izelmar", u""}}) {
    Create(0, typed);
    EXPECT_EQ(page.frsCon_txtEmailUN.Value(), mail);
  }
}

TEST_F(Creation, Both_error_marks_go) {
  page.frsCon_lblError0.Visible = page.frsCon_lblError1.Visible = true;

  Create(0);

  EXPECT_FALSE(page.frsCon_lblError0.Visible());
  EXPECT_FALSE(page.frsCon_lblError1.Visible());
}

TEST_F(Creation, The_button_stays_disabled_until_the_end_though_the_boxes_change) {
  bool enabled = true;
  desktop.OnBox = [&] { enabled = page.frsCon_cmdCreate.Enabled(); };

  Create(0, u"USER", u"SECRET");

  EXPECT_FALSE(enabled);
  EXPECT_TRUE(page.frsCon_cmdCreate.Enabled());
}

TEST_F(Creation, The_button_is_disabled_while_the_card_is_picked) {
  machine.adapters.Cards = {"First card", "Second card"};
  bool enabled = true;
  WhileChoosing([&](frmNetworkAdapters& form) {
    enabled = page.frsCon_cmdCreate.Enabled();
    form.lstNICs.SelectItem(0);
    desktop.Click(form.Command1);
  });

  Create(2, u"USER");

  EXPECT_FALSE(enabled);
  EXPECT_TRUE(page.frsCon_cmdCreate.Enabled());
}

TEST_F(Creation, The_button_is_enabled_at_the_end_of_a_failure_too) {
  machine.ras.Refuse("RasSetEntryPropertiesA", 5);

  Create(0);

  EXPECT_TRUE(page.frsCon_cmdCreate.Enabled());
}

TEST_F(Creation, A_version_that_cannot_be_read_is_told_and_nothing_else_comes_of_it) {
  machine.system.FailVersion = true;

  Create(0);

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  Error Getting OS Information");
  EXPECT_EQ(desktop.Boxes[1], success);
  EXPECT_EQ(machine.ras.Entry("097")->properties, PppoeRecord());
}

TEST_F(Creation, A_failure_is_told_by_the_layer_and_then_by_the_page) {
  machine.ras.Refuse("RasSetEntryPropertiesA", 5);

  Create(0, u"USER", u"SECRET");

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_EQ(desktop.Boxes[1], failure);
}

TEST_F(Creation, After_a_failure_the_page_stays_with_the_texts_as_they_were_mended) {
  machine.ras.Refuse("RasSetEntryPropertiesA", 5);

  Create(0, u"USER", u"SECRET");

  EXPECT_FALSE(WentOnToMail());
  EXPECT_TRUE(page.frsCon_Frame1.Visible());
  EXPECT_EQ(page.frsCon_txtUsername.Value(), u"user@097");
  EXPECT_EQ(page.frsCon_txtPassword.Value(), u"secret");
  EXPECT_EQ(page.frsCon_txtEmailUN.Value(), u"");
}

TEST_F(Creation, Parameters_that_cannot_be_saved_fail_it_too) {
  machine.ras.Refuse("RasSetEntryDialParamsA", 5);

  Create(0);

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1], failure);
}

TEST_F(Creation, A_machine_without_remote_access_gets_the_box_of_failure) {
  machine.ras.IsThere = false;

  Create(0);

  ASSERT_FALSE(desktop.Boxes.empty());
  EXPECT_EQ(desktop.Boxes.back(), failure);
  EXPECT_TRUE(page.frsCon_cmdCreate.Enabled());
}

TEST_F(Creation, Without_such_a_device_the_name_goes_empty_to_the_machine_which_decides) {
  machine.ras.Devices = {{"modem", "Old modem"}};

  Create(0);

  ASSERT_TRUE(HasEntry("097"));
  EXPECT_EQ(machine.ras.Entry("097")->DeviceName(), "");
  EXPECT_EQ(machine.ras.Entry("097")->DeviceType(), "pppoe");
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{success});
}

TEST_F(Creation, The_device_is_found_by_its_type_and_taken_by_its_name) {
  machine.ras.Devices = {{"modem", "pppoe"}, {"pppoe", "WAN Miniport (PPPOE)"}};

  Create(0);

  EXPECT_EQ(machine.ras.Entry("097")->DeviceName(), "WAN Miniport (PPPOE)");
  EXPECT_EQ(machine.ras.Entry("097")->DeviceType(), "pppoe");
}

TEST_F(Creation, An_entry_of_an_earlier_run_is_written_over) {
  Create(4, u"first", u"one");

  Create(0, u"second", u"two");

  EXPECT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"097"});
  EXPECT_EQ(machine.ras.Entry("097")->properties, PppoeRecord());
  EXPECT_EQ(machine.ras.Entry("097")->userName, "second@097");
  EXPECT_EQ(machine.ras.Entry("097")->password, "two");
}

TEST_F(Creation, Without_a_modem_an_empty_record_is_what_the_machine_gets) {
  for (const std::int16_t modem : {-1, 5}) {
    machine.ras.RemoveEntry("097");
    Create(modem, u"user", u"secret");
    ASSERT_TRUE(HasEntry("097")) << modem;
    EXPECT_EQ(machine.ras.Entry("097")->properties, RecordOf({}, "", "")) << modem;
    EXPECT_EQ(machine.ras.Entry("097")->userName, "") << modem;
  }
}

TEST_F(Creation, A_card_that_nobody_picks_is_told_and_the_entry_is_made_all_the_same) {
  machine.adapters.Cards = {"First card", "Second card"};
  WhileChoosing([&](frmNetworkAdapters& form) { desktop.Click(form.cmdClose); });

  Create(2);

  EXPECT_EQ(
      desktop.Boxes,
      (std::vector<Box>{TitledBox(u"לא בחרת כרטיס רשת להגדרה!\r\nעליך להגדירו באופן ידני.", 0x20), success}));
  EXPECT_EQ(machine.ras.Entry("097")->properties, VpnRecord());
  EXPECT_TRUE(CallsStartingWith("EnableStatic").empty());
}

TEST_F(Creation, Without_a_network_card_it_ends_in_a_fault_and_no_entry_is_made) {
  EXPECT_EQ(FaultNumberOf([&] { Create(2); }), 91);
  EXPECT_FALSE(HasEntry("097"));
}

TEST_F(Creation, The_card_is_set_up_before_the_entry_is_written) {
  machine.adapters.Cards = {"First card"};

  Create(2);

  const auto card = std::find_if(machine.Calls.begin(), machine.Calls.end(),
                                 [](const std::string& call) { return call.starts_with("SetGateways"); });
  EXPECT_NE(std::find(card, machine.Calls.end(), "RasSetEntryPropertiesA 097"), machine.Calls.end());
}

} // namespace
} // namespace quendra::provisioning
