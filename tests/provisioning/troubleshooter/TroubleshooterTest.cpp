#include "provisioning/troubleshooter/Troubleshooter.h"

#include "provisioning/troubleshooter/TroubleshooterFixture.h"

namespace quendra::provisioning {
namespace {

using Check = TroubleshooterTest;

TEST_F(Check, Dials_the_picked_entry_for_the_window_with_the_login_that_is_saved) {
  machine.ras.Dial("Home").Then(0);
  Open();
  Pick("Home");

  ClickCheck();

  ASSERT_EQ(machine.ras.Dials.size(), 1u);
  const auto& dial = machine.ras.Dials[0];
  EXPECT_EQ(EntryNameOf(dial), "Home");
  EXPECT_EQ(dial.notifier.type, 0xFFFFFFFFu);
  EXPECT_EQ(dial.notifier.window, form.Window());
  EXPECT_EQ(diagnosis.CurrentDialEntry, u"Home");
}

TEST_F(Check, The_button_is_disabled_while_a_dial_is_under_way) {
  machine.ras.Dial("Home").Then(0).Then(5);
  Open();
  Pick("Home");

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_FALSE(form.cmdCheck.Enabled());
}

TEST_F(Check, Each_change_of_the_dial_is_a_line) {
  machine.ras.Dial("Home").Then(0).Then(5).Then(10).Then(24).ThenConnected();
  Open();
  Pick("Home");

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_EQ(form.txtStatus.Value(),
            u"\r\nפעולה: 0 - פותח פורט תקשורת\r\nפעולה: 5 - מאמת שם משתמש וסיסמא"
            u"\r\nפעולה: 10 - Projection phase is starting\r\nפעולה: 24 - ...\r\nפעולה: 8192 - התחבר בהצלחה");
}

TEST_F(Check, Each_line_of_the_dial_is_shown_at_once) {
  machine.ras.Dial("Home").Then(0).Then(5);
  Open();
  Pick("Home");

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_EQ(desktop.CountOf("Repaint txtStatus"), 2);
}

TEST_F(Check, A_dial_that_connects_is_not_diagnosed_and_leaves_the_button_disabled) {
  machine.ras.Dial("Home").ThenConnected();
  Open();
  Pick("Home");

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_TRUE(Findings().empty());
  EXPECT_FALSE(form.cmdCheck.Enabled());
  EXPECT_EQ(machine.ras.Connections().size(), 1u);
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
}

TEST_F(Check, Hangs_up_whatever_is_open_before_it_dials) {
  machine.ras.Connect("Another");
  machine.ras.Dial("Home").Then(0);
  Open();
  Pick("Home");

  ClickCheck();

  ASSERT_EQ(machine.ras.Connections().size(), 1u);
  EXPECT_EQ(machine.ras.Connections().front().entryName, "Home");
}

TEST_F(Check, Hangs_up_before_a_simulated_number_too) {
  machine.ras.Connect("Another");

  Simulate("Home", u"720");

  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_TRUE(machine.ras.Dials.empty());
}

TEST_F(Check, Remote_access_that_goes_between_opening_and_check_ends_in_no_dial_and_a_disabled_button) {
  Open();
  Pick("Home");
  machine.ras.IsThere = false;

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(dun.ActiveRasConn, platform::kNoRasConnection);
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_TRUE(Lines().empty());
  EXPECT_FALSE(form.cmdCheck.Enabled());
}

TEST_F(Check, Without_a_picked_entry_the_index_is_outside_the_names) {
  Open();

  EXPECT_EQ(FaultNumberOf([&] { troubleshooter.cmdCheck_Click(); }), 9);
  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(Check, Without_a_picked_entry_the_program_ends_with_the_fault) {
  Open();

  ClickCheck();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(Check, Where_no_entries_could_be_listed_there_is_none_to_pick) {
  machine.ras.Refuse("RasEnumEntriesA", 5);
  Open();

  EXPECT_EQ(FaultNumberOf([&] { troubleshooter.cmdCheck_Click(); }), 9);
}

TEST_F(Check, A_text_that_is_no_number_is_of_the_wrong_type) {
  Open();
  Pick("Home");
  for (const char16_t* text : {u"abc", u" ", u"691x", u"שגיאה", u"6 9 1", u"-"}) {
    form.txtEmunrateError.Value = Text(text);
    EXPECT_EQ(FaultNumberOf([&] { troubleshooter.cmdCheck_Click(); }), 13) << ToUtf8(text);
  }
}

TEST_F(Check, A_text_that_is_no_number_has_hung_up_before_it_fails) {
  machine.ras.Connect("Another");
  Open();
  Pick("Home");
  form.txtEmunrateError.Value = u"abc";

  EXPECT_EQ(FaultNumberOf([&] { troubleshooter.cmdCheck_Click(); }), 13);

  EXPECT_TRUE(machine.ras.Connections().empty());
}

TEST_F(Check, A_number_beyond_32_bits_overflows) {
  Open();
  Pick("Home");
  for (const char16_t* text : {u"2147483648", u"-2147483649", u"1e400"}) {
    form.txtEmunrateError.Value = Text(text);
    EXPECT_EQ(FaultNumberOf([&] { troubleshooter.cmdCheck_Click(); }), 6) << ToUtf8(text);
  }
}

TEST_F(Check, A_simulated_number_is_rounded_and_may_have_blanks_around_it) {
  Simulate("Home", u" 719.6 ");

  EXPECT_EQ(Findings(), (std::vector<Text>{u"שגיאה: 720 - כרגע לא בערכת התקלות המטופלות - פנה לתומך..."}));
}

TEST_F(Check, A_number_half_way_goes_to_the_even_one) {
  for (const auto& [text, even] :
       {std::pair{u"719.5", u"720"}, std::pair{u"720.5", u"720"}, std::pair{u"721.5", u"722"}}) {
    Simulate("Home", text);
    EXPECT_EQ(Lines().front(), u"שגיאה: " + Text(even) + u" - כרגע לא בערכת התקלות המטופלות - פנה לתומך...");
    desktop.Click(form.Command1);
  }
}

TEST_F(Check, After_a_simulated_number_the_button_stays_disabled_until_the_form_opens_again) {
  Simulate("Home", u"720");
  EXPECT_FALSE(form.cmdCheck.Enabled());

  desktop.Click(form.Command1);
  Open();

  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(Check, After_a_real_failure_another_check_can_be_made) {
  FailWith("Home", 720);
  ASSERT_TRUE(form.cmdCheck.Enabled());
  machine.ras.Dial("Home").Then(5).ThenError(720);

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_EQ(machine.ras.Dials.size(), 2u);
  EXPECT_EQ(Lines(),
            (std::vector<Text>{u"פעולה: 0 - פותח פורט תקשורת",
                               u"שגיאה: 720 - כרגע לא בערכת התקלות המטופלות - פנה לתומך...",
                               u"פעולה: 5 - מאמת שם משתמש וסיסמא", u"פעולה: 5 - מאמת שם משתמש וסיסמא",
                               u"שגיאה: 720 - כרגע לא בערכת התקלות המטופלות - פנה לתומך..."}));
}

TEST_F(Check, After_a_connection_that_ended_with_its_dialog_another_check_dials) {
  machine.ras.Dial("Home").ThenConnected();
  Open();
  Pick("Home");
  ClickCheck();
  desktop.RunUntilIdle();
  desktop.Click(form.Command1);
  Open();
  Pick("Away");

  ClickCheck();

  EXPECT_TRUE(desktop.Boxes.empty());
  ASSERT_EQ(machine.ras.Dials.size(), 2u);
  EXPECT_EQ(EntryNameOf(machine.ras.Dials[1]), "Away");
}

TEST_F(Check, The_name_under_check_stays_as_it_is_listed) {
  machine.ras.Dial("Home").Then(0);
  Open();
  Pick("Home");

  ClickCheck();

  EXPECT_EQ(diagnosis.CurrentDialEntry.size(), 4u);
}

TEST_F(Check, A_form_that_is_closed_while_a_dial_is_under_way_hears_no_more_of_it) {
  machine.ras.Dial("Home").Then(0).Then(5).ThenError(691);
  Open();
  Pick("Home");
  ClickCheck();
  desktop.PumpOnce();

  desktop.CloseBox(form);
  desktop.RunUntilIdle();

  EXPECT_FALSE(desktop.Ended && desktop.EndStatus != 0);
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_TRUE(machine.ras.Connections().empty());
}

TEST_F(Check, A_dial_of_an_earlier_opening_says_nothing_in_the_next) {
  machine.ras.Dial("Home").Then(0).Then(5).ThenError(691);
  Open();
  Pick("Home");
  ClickCheck();
  const WindowHandle before = form.Window();
  desktop.Click(form.Command1);
  Open();

  desktop.PostMessage(before, dun.RasDialEventMessage, 5, 691);
  desktop.RunUntilIdle();

  EXPECT_EQ(form.txtStatus.Value(), u"");
}

TEST_F(Check, A_change_that_comes_while_a_diagnosis_stands_in_a_box_waits_for_its_end) {
  machine.ras.Dial("Away").ThenError(678);
  Open();
  Pick("Away");
  int boxes = 0;
  desktop.OnBox = [&] {
    if (++boxes == 1) troubleshooter.OnDialEvent(8193, 0);
    EXPECT_EQ(Lines().back(), u"שגיאה: 678 - מטפל...");
  };

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_EQ(boxes, 3);
  EXPECT_EQ(Lines().back(), u"פעולה: 8193 - מנותק או לא נכשל בחיבור");
  EXPECT_EQ(Findings().size(), 4u);
}

TEST_F(Check, A_change_that_arrives_through_the_window_while_a_box_stands_is_shown_after_it) {
  FailWith("Home", 720);
  machine.ras.Dial("Away").ThenError(678);
  Pick("Away");
  std::vector<Text> lastWhileABoxStands;
  desktop.OnBox = [&] {
    if (lastWhileABoxStands.empty()) desktop.PostMessage(form.Window(), dun.RasDialEventMessage, 8193, 0);
    desktop.PumpOnce();
    lastWhileABoxStands.push_back(Lines().back());
  };

  ClickCheck(); // the window's second dial: the hook is its own predecessor
  desktop.RunUntilIdle();

  EXPECT_EQ(lastWhileABoxStands, std::vector<Text>(3, u"שגיאה: 678 - מטפל..."));
  const Text told = u"פעולה: 8193 - מנותק או לא נכשל בחיבור";
  const std::vector<Text> lines = Lines();
  EXPECT_EQ(lines.back(), told);
  EXPECT_EQ(std::count(lines.begin(), lines.end(), told), 1);
}

TEST_F(Check, A_second_error_that_comes_while_a_box_stands_is_diagnosed_after_the_first) {
  machine.ras.Dial("Away").ThenError(678);
  Open();
  Pick("Away");
  desktop.OnBox = [&, told = false]() mutable {
    if (!std::exchange(told, true)) troubleshooter.OnDialEvent(8193, 631);
  };

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_EQ(Lines().back(), u"שגיאה: 631 - כרגע לא בערכת התקלות המטופלות - פנה לתומך...");
  EXPECT_EQ(desktop.Boxes.size(), 3u);
  EXPECT_TRUE(form.cmdCheck.Enabled());
}

TEST_F(Check, A_change_that_comes_during_a_simulated_number_waits_until_the_button_is_disabled) {
  bool wasEnabled = true;
  desktop.OnBox = [&, told = false]() mutable {
    if (!std::exchange(told, true)) troubleshooter.OnDialEvent(5, 0);
    wasEnabled = form.cmdCheck.Enabled();
  };

  Simulate("Away", u"633");

  EXPECT_TRUE(wasEnabled);
  EXPECT_EQ(Lines().back(), u"פעולה: 5 - מאמת שם משתמש וסיסמא");
  EXPECT_FALSE(form.cmdCheck.Enabled());
}

TEST_F(Check, Changes_that_wait_are_dropped_when_the_form_goes) {
  machine.ras.Dial("Away").ThenError(678);
  Open();
  Pick("Away");
  desktop.OnBox = [&, told = false]() mutable {
    if (std::exchange(told, true)) return;
    troubleshooter.OnDialEvent(5, 691);
    desktop.Unload(form);
  };

  ClickCheck();
  desktop.RunUntilIdle();

  EXPECT_TRUE(CallsStartingWith("RasSetEntryPropertiesA").empty());
  EXPECT_FALSE(HasEntry("097tmp"));
}

TEST_F(Check, No_more_changes_wait_than_any_dial_has) {
  desktop.OnBox = [&, told = false]() mutable {
    if (std::exchange(told, true)) return;
    for (int i = 0; i < 1000; ++i) troubleshooter.OnDialEvent(5, 0);
  };

  Simulate("Away", u"633");

  EXPECT_EQ(Lines().size() - Findings().size(), 256u);
}

TEST_F(Check, A_state_that_no_system_has_is_shown_as_it_came) {
  Open();

  troubleshooter.OnDialEvent(0xFFFFFFFF, 0);

  EXPECT_EQ(Lines(), std::vector<Text>{u"פעולה: -1 - ..."});
}

} // namespace
} // namespace quendra::provisioning
