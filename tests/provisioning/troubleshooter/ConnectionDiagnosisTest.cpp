#include "provisioning/troubleshooter/ConnectionDiagnosis.h"

#include "provisioning/troubleshooter/TroubleshooterFixture.h"

namespace quendra::provisioning {
namespace {

class Diagnosis : public TroubleshooterTest {
 protected:
  /// A test's entry that an earlier run has left.
  void LeaveTestEntry() { machine.ras.AddEntry("097tmp").SetDevice("pppoe", "pppoe").SetLogin("1@1", "x"); }
};

// Any other number.

TEST_F(Diagnosis, A_real_error_without_a_treatment_is_referred_to_support) {
  FailWith("Home", 720);

  EXPECT_EQ(Findings(), std::vector<Text>{u"שגיאה: 720 - כרגע לא בערכת התקלות המטופלות - פנה לתומך..."});
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
  EXPECT_TRUE(form.cmdCheck.Enabled());
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(Diagnosis, Neighbours_of_the_treated_numbers_are_referred_to_support) {
  for (const std::int32_t number : {-2147483647 - 1, -1, 0, 632, 634, 677, 679, 690, 692, 2147483647}) {
    Open();
    diagnosis.CurrentDialEntry = u"Home";
    diagnosis.DiagnoseConnectionError(number);
    EXPECT_EQ(Findings(), std::vector<Text>{u"שגיאה: " + DecimalText(number) +
                                            u" - כרגע לא בערכת התקלות המטופלות - פנה לתומך..."});
    desktop.Unload(form);
  }
}

TEST_F(Diagnosis, The_end_forgets_the_entry_and_hangs_up) {
  FailWith("Home", 720);

  EXPECT_EQ(diagnosis.CurrentDialEntry, u"");
  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(dun.ActiveRasConn, platform::kNoRasConnection);
}

TEST_F(Diagnosis, The_end_undoes_a_hook_that_is_still_known) {
  Open();
  dun.HookDialEvents(form.Window());
  diagnosis.CurrentDialEntry = u"Home";

  diagnosis.DiagnoseConnectionError(720);

  EXPECT_EQ(dun.HookedWindow, kNoWindow);
}

TEST_F(Diagnosis, A_second_check_leaves_the_red_line_of_the_first) {
  FailWith("Home", 678);
  ASSERT_EQ(form.lblDiagnoze.Caption(), kModemSilent);
  machine.ras.Dial("Long").ThenError(720);
  Pick("Long");

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_EQ(Findings().back(), u"שגיאה: 720 - כרגע לא בערכת התקלות המטופלות - פנה לתומך...");
  EXPECT_EQ(form.lblDiagnoze.Caption(), kModemSilent);
  EXPECT_TRUE(IsRed());
}

// 691.

TEST_F(Diagnosis, A_real_refusal_makes_the_test_entry_and_finds_the_connection_still_open) {
  FailWith("Home", 691);

  EXPECT_EQ(desktop.Boxes, std::vector<Box>{alreadyOpen});
  EXPECT_EQ(machine.ras.Dials.size(), 1u);
  EXPECT_TRUE(HasEntry("097tmp"));
  EXPECT_EQ(Findings(), std::vector<Text>{u"מנסה חיבור לזלמר..."});
}

TEST_F(Diagnosis, After_a_real_refusal_the_end_hangs_up_and_enables_the_button) {
  FailWith("Home", 691);

  EXPECT_EQ(dun.ActiveRasConn, platform::kNoRasConnection);
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"");
  EXPECT_TRUE(form.cmdCheck.Enabled());
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
}

TEST_F(Diagnosis, The_test_entry_is_the_failed_one_with_another_user_name) {
  Simulate("Home", u"691");

  ASSERT_TRUE(HasEntry("097tmp"));
  const auto& test = *machine.ras.Entry("097tmp");
  EXPECT_EQ(test.properties, machine.ras.Entry("Home")->properties);
  EXPECT_EQ(test.userName, "1@1");
  EXPECT_EQ(test.password, "secret");
}

TEST_F(Diagnosis, A_simulated_refusal_dials_the_test_entry_and_waits_for_it) {
  Simulate("Home", u"691");

  ASSERT_EQ(machine.ras.Dials.size(), 1u);
  EXPECT_EQ(EntryNameOf(machine.ras.Dials[0]), "097tmp");
  EXPECT_EQ(machine.ras.Dials[0].notifier.window, kNoWindow);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(Diagnosis, A_simulated_refusal_leaves_the_test_entry_and_hangs_its_dial_up) {
  Simulate("Home", u"691");

  EXPECT_TRUE(HasEntry("097tmp"));
  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"");
}

TEST_F(Diagnosis, What_the_test_dial_came_to_is_not_looked_at) {
  machine.ras.Dial("097tmp").Then(5).ThenError(691);

  Simulate("Home", u"691");
  desktop.RunUntilIdle();

  EXPECT_EQ(Lines(), std::vector<Text>{u"מנסה חיבור לזלמר..."});
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
}

TEST_F(Diagnosis, A_refused_entry_that_is_gone_is_told_and_nothing_is_made) {
  Open();
  diagnosis.CurrentDialEntry = u"Gone";

  diagnosis.DiagnoseConnectionError(691);

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_EQ(desktop.Boxes[1], error);
  EXPECT_FALSE(HasEntry("097tmp"));
  EXPECT_TRUE(machine.ras.Dials.empty());
  EXPECT_TRUE(Lines().empty());
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"");
  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(Diagnosis, A_test_entry_that_cannot_be_made_is_told_and_nothing_is_dialled) {
  machine.ras.Refuse("RasSetEntryPropertiesA", 5);

  Simulate("Home", u"691");

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1], error);
  EXPECT_TRUE(machine.ras.Dials.empty());
  EXPECT_TRUE(Lines().empty());
}

// The test entry itself under check.

TEST_F(Diagnosis, A_left_over_test_entry_that_fails_gives_the_providers_number_and_goes) {
  for (const std::uint32_t number : {678u, 691u}) {
    LeaveTestEntry();
    FailWith("097tmp", number);
    EXPECT_EQ(form.lblDiagnoze.Caption(), kExchange) << number;
    EXPECT_TRUE(IsRed()) << number;
    EXPECT_EQ(Findings(), std::vector<Text>{u"שגיאה: " + DecimalText(number)});
    EXPECT_FALSE(HasEntry("097tmp")) << number;
    EXPECT_TRUE(machine.ras.Connections().empty()) << number;
    desktop.Unload(form);
  }
}

TEST_F(Diagnosis, After_the_providers_number_the_button_stays_disabled_and_the_entry_under_check) {
  LeaveTestEntry();

  FailWith("097tmp", 678);

  EXPECT_FALSE(form.cmdCheck.Enabled());
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"097tmp");
}

TEST_F(Diagnosis, A_test_entry_that_another_program_deleted_is_told_by_the_layer) {
  LeaveTestEntry();
  machine.ras.Dial("097tmp").Meanwhile([&] { machine.ras.RemoveEntry("097tmp"); }).ThenError(678);
  Open();
  Pick("097tmp");

  ClickCheck();
  desktop.RunUntilIdle();

  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_EQ(form.lblDiagnoze.Caption(), kExchange);
}

TEST_F(Diagnosis, A_left_over_test_entry_with_any_other_error_goes_without_a_word) {
  LeaveTestEntry();

  FailWith("097tmp", 720);

  EXPECT_TRUE(Findings().empty());
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
  EXPECT_FALSE(HasEntry("097tmp"));
  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"");
  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(Diagnosis, The_modem_is_not_checked_for_the_test_entry) {
  LeaveTestEntry();

  FailWith("097tmp", 633);

  EXPECT_TRUE(machine.icmp.Echoes.empty());
  EXPECT_TRUE(Findings().empty());
  EXPECT_FALSE(HasEntry("097tmp"));
}

TEST_F(Diagnosis, A_name_like_that_of_the_test_entry_is_another_entry) {
  for (const char* name : {"097TMP", "097tmp2", "097"}) {
    machine.ras.AddEntry(name).SetDevice("pppoe", "pppoe");
    Simulate(name, u"720");
    EXPECT_EQ(Findings().size(), 1u) << name;
    EXPECT_TRUE(HasEntry(name)) << name;
    desktop.Unload(form);
    desktop.RunUntilIdle();
  }
}

} // namespace
} // namespace quendra::provisioning
