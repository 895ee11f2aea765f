#include "forms/view/Keyboard.h"
#include "provisioning/FirstConnectionPageFixture.h"

namespace quendra::provisioning {
namespace {

class ModemRows : public FirstConnectionPageTest {
 protected:
  ModemRows() { OpenConnectionStep(); }

  std::vector<forms::Control*> PartsOf(std::size_t row) {
    return {&connection.frsCon_imgModems[row], &connection.frsCon_lblModemBG[row],
            &connection.frsCon_lblModems[row]};
  }
  bool CanCreate() const { return connection.frsCon_cmdCreate.Enabled(); }
};

TEST_F(ModemRows, Bear_the_models_with_the_blanks_in_their_captions) {
  const std::vector<Text> captions{u"Samsung AHT E300", u"     Alcatel     510", u"Alcatel Speed Touch Home",
                                   u"ECI B-FoCUS +270/312", u" Aztech  E600"};
  for (std::size_t row = 0; row < captions.size(); ++row)
    EXPECT_EQ(connection.frsCon_lblModems[row].Caption(), captions[row]) << row;
}

TEST_F(ModemRows, Stand_beside_fields_of_which_the_password_is_masked) {
  EXPECT_TRUE(connection.frsCon_txtPassword.Masked());
  EXPECT_FALSE(connection.frsCon_txtUsername.Masked());
}

TEST_F(ModemRows, Under_the_mouse_are_painted_one_at_a_time_by_each_of_their_parts) {
  for (std::size_t row = 0; row < 5; ++row)
    for (forms::Control* part : PartsOf(row)) {
      desktop.MouseMove(connection.frsCon_Frame1);
      ASSERT_TRUE(Opaque(modemGrounds).empty());
      ASSERT_EQ(page.HoverModem, -1);

      desktop.MouseMove(*part);

      EXPECT_EQ(Opaque(modemGrounds), Rows{row}) << ToUtf8(part->Name());
      EXPECT_EQ(page.HoverModem, static_cast<int>(row));
      EXPECT_EQ(page.SelectedModem, -1);
    }
}

TEST_F(ModemRows, Under_a_mouse_that_goes_from_one_to_the_next_give_the_paint_on) {
  desktop.MouseMove(connection.frsCon_lblModems[1]);

  desktop.MouseMove(connection.frsCon_lblModems[4]);

  EXPECT_EQ(Opaque(modemGrounds), Rows{4});
}

TEST_F(ModemRows, Under_a_mouse_that_stays_are_painted_once) {
  desktop.MouseMove(connection.frsCon_lblModems[1]);
  modemGrounds[1].Transparent = true;

  desktop.MouseMove(connection.frsCon_lblModems[1]);

  EXPECT_TRUE(Opaque(modemGrounds).empty());
}

TEST_F(ModemRows, Are_chosen_by_each_of_their_parts_and_turn_green_one_at_a_time) {
  for (std::size_t row = 0; row < 5; ++row)
    for (forms::Control* part : PartsOf(row)) {
      page.SelectModemRow(-1);
      ASSERT_EQ(White(modemGrounds), (Rows{0, 1, 2, 3, 4}));

      desktop.Click(*part);

      EXPECT_EQ(page.SelectedModem, static_cast<int>(row)) << ToUtf8(part->Name());
      EXPECT_EQ(page.HoverModem, static_cast<int>(row));
      EXPECT_EQ(Green(modemGrounds), Rows{row});
      EXPECT_EQ(White(modemGrounds).size(), 4u);
    }
}

TEST_F(ModemRows, Left_by_the_mouse_lose_the_hover_and_the_chosen_one_keeps_its_green) {
  desktop.MouseMove(connection.frsCon_lblModems[3]);
  desktop.Click(connection.frsCon_lblModems[3]);
  desktop.MouseMove(connection.frsCon_lblModems[0]);

  desktop.MouseMove(connection.frsCon_Frame1);

  EXPECT_TRUE(Opaque(modemGrounds).empty());
  EXPECT_EQ(Green(modemGrounds), Rows{3});
  EXPECT_EQ(page.SelectedModem, 3);
}

TEST_F(ModemRows, Show_the_chosen_one_again_when_a_field_gets_the_focus) {
  while (desktop.Focused(window) != &page.frsCon_lblBack) desktop.PressKey(window, forms::kTabKey);
  for (const forms::TextBox* field : {&connection.frsCon_txtUsername, &connection.frsCon_txtPassword}) {
    desktop.Click(connection.frsCon_lblModems[3]);
    desktop.MouseMove(connection.frsCon_Frame1);
    ShowAllMarks();

    desktop.PressKey(window, forms::kTabKey);

    ASSERT_EQ(desktop.Focused(window), field);
    EXPECT_EQ(Opaque(modemGrounds), Rows{3});
    EXPECT_EQ(page.HoverModem, 3);
    EXPECT_EQ(Marks(), (std::vector<bool>{false, false, true}));
  }
}

TEST_F(ModemRows, Without_a_choice_show_none_when_a_field_gets_the_focus) {
  desktop.MouseMove(connection.frsCon_lblModems[3]);

  connection.frsCon_txtPassword.GotFocus();

  EXPECT_TRUE(Opaque(modemGrounds).empty());
  EXPECT_EQ(page.HoverModem, -1);
}

TEST_F(ModemRows, Chosen_by_a_key_are_painted_as_by_the_mouse) {
  while (desktop.Focused(window) != &connection.frsCon_lblModems[2]) desktop.PressKey(window, forms::kTabKey);

  desktop.PressKey(window, forms::kEnterKey);

  EXPECT_EQ(page.SelectedModem, 2);
  EXPECT_EQ(Opaque(modemGrounds), Rows{2});
  EXPECT_EQ(Green(modemGrounds), Rows{2});
}

TEST_F(ModemRows, Hide_the_marks_of_the_connection_and_not_that_of_the_mail) {
  const std::vector<bool> mailAlone{false, false, true};
  ShowAllMarks();
  page.HoverModemRow(page.HoverModem);
  EXPECT_EQ(Marks(), mailAlone);

  ShowAllMarks();
  page.SelectModemRow(1);
  EXPECT_EQ(Marks(), mailAlone);

  ShowAllMarks();
  desktop.MouseMove(connection.frsCon_Frame1);
  EXPECT_EQ(Marks(), mailAlone);
}

TEST_F(ModemRows, Of_a_number_that_no_row_has_paint_nothing) {
  for (const std::int16_t row : {std::int16_t{-2}, std::int16_t{5}, std::int16_t{32767}}) {
    page.HoverModemRow(row);
    page.SelectModemRow(row);
    EXPECT_TRUE(Opaque(modemGrounds).empty());
    EXPECT_TRUE(Green(modemGrounds).empty());
  }
}

TEST_F(ModemRows, The_connection_can_be_made_once_a_modem_is_chosen_and_both_fields_are_filled) {
  EXPECT_FALSE(CanCreate());
  FillConnection();
  EXPECT_FALSE(CanCreate());

  desktop.Click(connection.frsCon_lblModems[0]);
  EXPECT_TRUE(CanCreate());

  connection.frsCon_txtPassword.Value = Text();
  EXPECT_FALSE(CanCreate());
  connection.frsCon_txtPassword.Value = u"x";
  EXPECT_TRUE(CanCreate());
  connection.frsCon_txtUsername.Value = Text();
  EXPECT_FALSE(CanCreate());
}

TEST_F(ModemRows, The_connection_can_not_be_made_without_a_modem_whichever_comes_last) {
  FillConnection();
  desktop.Click(connection.frsCon_lblModems[0]);
  page.SelectModemRow(-1);
  EXPECT_FALSE(CanCreate());
}

} // namespace
} // namespace quendra::provisioning
