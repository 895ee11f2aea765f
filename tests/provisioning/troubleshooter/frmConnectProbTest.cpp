#include "provisioning/troubleshooter/frmConnectProb.h"

#include "forms/view/Keyboard.h"
#include "provisioning/troubleshooter/TroubleshooterFixture.h"

namespace quendra::provisioning {
namespace {

class ConnectProb : public TroubleshooterTest {
 protected:
  std::vector<Text> Items() const {
    std::vector<Text> items;
    for (int row = 0; row < form.cmbDialups.ListCount(); ++row) items.push_back(form.cmbDialups.List(row));
    return items;
  }
  void TabTo(const forms::Control& control) {
    for (int stops = 0; stops < 10 && desktop.Focused(form) != &control; ++stops)
      desktop.PressKey(form, forms::kTabKey);
    ASSERT_EQ(desktop.Focused(form), &control);
  }
  const Box failure = TitledBox(u"נכשל!", 0x10);
};

TEST_F(ConnectProb, Says_what_each_of_its_fields_is_for) {
  Open();

  EXPECT_EQ(form.Caption(), u"בעית חיבור");
  EXPECT_EQ(form.Label1.Caption(), u"בחר את החיבור:");
  EXPECT_EQ(form.Label2.Caption(), u"סטטוס:");
  EXPECT_EQ(form.Label3.Caption(), u"דמה שגיאה:");
  EXPECT_EQ(form.Label4.Caption(), u"אבחון:");
  EXPECT_EQ(form.cmdCheck.Caption(), u"בדוק...");
  EXPECT_EQ(form.Command1.Caption(), u"סגור");
}

TEST_F(ConnectProb, Opens_with_the_entries_in_their_order_and_none_picked) {
  Open();

  EXPECT_EQ(Items(), (std::vector<Text>{u"Long", u"Home", u"Away"}));
  EXPECT_EQ(form.cmbDialups.ListIndex(), -1);
  EXPECT_TRUE(form.cmdCheck.Enabled());
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(ConnectProb, Opens_with_nothing_said) {
  Open();

  EXPECT_EQ(form.txtStatus.Value(), u"");
  EXPECT_EQ(form.txtEmunrateError.Value(), u"");
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
}

TEST_F(ConnectProb, Opens_after_the_box_of_failure_where_entries_cannot_be_listed) {
  machine.ras.Refuse("RasEnumEntriesA", 5);

  Open();

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_EQ(desktop.Boxes[1], failure);
  EXPECT_TRUE(form.Visible());
  EXPECT_TRUE(Items().empty());
}

TEST_F(ConnectProb, Opens_empty_with_the_layers_box_alone_where_the_second_listing_fails) {
  machine.ras.Refuse("RasEnumEntriesA", 5, 1);

  Open();

  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_TRUE(form.Visible());
  EXPECT_TRUE(Items().empty());
}

TEST_F(ConnectProb, A_phone_book_of_one_entry_counts_as_empty) {
  machine.ras.RemoveEntry("Long");
  machine.ras.RemoveEntry("Away");

  Open();

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].text, u"There are no Dial-Up entries on this system.");
  EXPECT_EQ(desktop.Boxes[1], failure);
  EXPECT_TRUE(Items().empty());
}

TEST_F(ConnectProb, Opens_afresh_each_time) {
  Simulate("Home", u"678");
  desktop.Click(form.Command1);
  machine.ras.RemoveEntry("Long");

  Open();

  EXPECT_EQ(Items(), (std::vector<Text>{u"Home", u"Away"}));
  EXPECT_EQ(form.cmbDialups.ListIndex(), -1);
  EXPECT_EQ(form.txtStatus.Value(), u"");
  EXPECT_EQ(form.txtEmunrateError.Value(), u"");
  EXPECT_EQ(form.lblDiagnoze.Caption(), u"");
  EXPECT_FALSE(IsRed());
}

TEST_F(ConnectProb, The_close_button_unloads_it) {
  Open();

  desktop.Click(form.Command1);

  EXPECT_FALSE(form.IsLoaded());
}

TEST_F(ConnectProb, Hangs_everything_up_when_it_closes) {
  Open();
  Pick("Home");
  ClickCheck();
  desktop.RunUntilIdle();
  machine.ras.Connect("Another");
  ASSERT_EQ(machine.ras.Connections().size(), 2u);

  desktop.CloseBox(form);

  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(dun.ActiveRasConn, platform::kNoRasConnection);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(ConnectProb, The_log_takes_many_lines_and_nothing_that_is_typed) {
  Open();

  EXPECT_TRUE(form.txtStatus.MultiLine);
  EXPECT_TRUE(form.txtStatus.ReadOnly());
  EXPECT_TRUE(form.txtStatus.VerticalScrollBar());
  EXPECT_FALSE(form.txtEmunrateError.ReadOnly());
  EXPECT_FALSE(form.cmbDialups.FreeText);
}

TEST_F(ConnectProb, Undoes_a_hook_that_its_window_still_has_when_it_closes) {
  Open();
  dun.HookDialEvents(form.Window());

  desktop.Click(form.Command1);

  EXPECT_EQ(dun.HookedWindow, kNoWindow);
  EXPECT_EQ(dun.RasDialEventMessage, 0u);
}

TEST_F(ConnectProb, Closes_in_silence_with_nothing_to_hang_up) {
  Open();

  desktop.Click(form.Command1);

  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(machine.ras.Count("RasHangUpA"), 0);
}

TEST_F(ConnectProb, The_log_shows_its_end) {
  Open();

  form.Append(u"one");
  form.Append(u"two");

  EXPECT_EQ(form.txtStatus.Value(), u"\r\none\r\ntwo");
  EXPECT_EQ(form.txtStatus.SelStart(), 10);
}

TEST_F(ConnectProb, Is_used_by_keys_alone) {
  Open();
  Pick("Home");
  form.txtEmunrateError.Value = u"720";
  TabTo(form.cmdCheck);

  ASSERT_TRUE(desktop.PressKey(form, forms::kSpaceKey));
  EXPECT_EQ(Lines().size(), 1u);
  ASSERT_TRUE(desktop.PressKey(form, forms::kEscapeKey));
  EXPECT_FALSE(form.IsLoaded());
}

TEST_F(ConnectProb, Enter_in_a_field_checks_nothing) {
  Open();
  for (const forms::Control* field : {static_cast<forms::Control*>(&form.cmbDialups),
                                      static_cast<forms::Control*>(&form.txtEmunrateError)}) {
    TabTo(*field);
    desktop.PressKey(form, forms::kEnterKey);
  }

  EXPECT_FALSE(desktop.Ended);
  EXPECT_TRUE(form.cmdCheck.Enabled());
  EXPECT_TRUE(Lines().empty());
}

} // namespace
} // namespace quendra::provisioning
