#include "provisioning/FirstConnectionPageFixture.h"

#include "forms/view/Accessible.h"
#include "forms/view/FocusOrder.h"

namespace quendra::provisioning {
namespace {

using FirstConnection = FirstConnectionPageTest;

TEST_F(FirstConnection, Opening_hides_the_marks_of_the_connection_and_leaves_that_of_the_mail) {
  ShowAllMarks();

  OpenPage();

  EXPECT_EQ(Marks(), (std::vector<bool>{false, false, true}));
  EXPECT_TRUE(page.IsOpen());
}

TEST_F(FirstConnection, Nothing_is_chosen_and_nothing_is_under_the_mouse_at_first) {
  OpenPage();

  for (const std::int16_t field : {page.SelectedModem, page.HoverModem, page.SelectedMail, page.HoverMail})
    EXPECT_EQ(field, -1);
  EXPECT_EQ(White(modemGrounds), (Rows{0, 1, 2, 3, 4}));
  EXPECT_TRUE(Opaque(modemGrounds).empty());
}

TEST_F(FirstConnection, Opening_again_clears_the_choices_and_paints_nothing) {
  tokens = u"OE|MSO XP|";
  OpenMailStep();
  desktop.MouseMove(mail.frsCon_lblMails[1]);
  desktop.Click(mail.frsCon_lblMails[1]);
  desktop.Click(page.frsCon_lblBack);
  desktop.Click(page.menu.frsCon_lblCaption[1]);
  desktop.MouseMove(connection.frsCon_lblModems[2]);
  desktop.Click(connection.frsCon_lblModems[2]);
  FillConnection();
  page.Stop();

  OpenPage();

  EXPECT_EQ(page.SelectedModem, -1);
  EXPECT_EQ(page.SelectedMail, -1);
  EXPECT_EQ(page.HoverModem, 2);
  EXPECT_EQ(page.HoverMail, 1);
  EXPECT_EQ(Green(modemGrounds), Rows{2});
  EXPECT_EQ(Opaque(modemGrounds), Rows{2});
  EXPECT_EQ(Green(mailGrounds), Rows{1});
  EXPECT_TRUE(connection.frsCon_Frame1.Visible());
  EXPECT_EQ(connection.frsCon_txtUsername.Value(), u"dana");

  desktop.Click(connection.frsCon_lblModems[4]);
  EXPECT_EQ(Green(modemGrounds), Rows{4});
}

TEST_F(FirstConnection, Opening_again_leaves_the_button_as_it_was_until_a_field_changes) {
  OpenConnectionStep();
  FillConnection();
  desktop.Click(connection.frsCon_lblModems[2]);
  page.Stop();

  OpenPage();

  EXPECT_EQ(page.SelectedModem, -1);
  EXPECT_TRUE(connection.frsCon_cmdCreate.Enabled());
  desktop.Type(connection.frsCon_txtPassword, u"x");
  EXPECT_FALSE(connection.frsCon_cmdCreate.Enabled());
}

TEST_F(FirstConnection, The_menu_opens_the_mail_step_by_its_first_hot_spot_and_the_connection_by_its_second) {
  OpenPage();
  EXPECT_FALSE(connection.frsCon_Frame1.Visible());
  EXPECT_FALSE(mail.frsCon_Frame2.Visible());

  desktop.Click(page.menu.frsCon_lblCaption[0]);
  EXPECT_TRUE(mail.frsCon_Frame2.Visible());
  EXPECT_FALSE(connection.frsCon_Frame1.Visible());
  desktop.Click(page.frsCon_lblBack);

  desktop.Click(page.menu.frsCon_lblCaption[1]);
  EXPECT_TRUE(connection.frsCon_Frame1.Visible());
  EXPECT_FALSE(mail.frsCon_Frame2.Visible());
}

TEST_F(FirstConnection, Back_closes_the_connection_step_then_the_mail_step_then_the_page) {
  OpenConnectionStep();
  mail.frsCon_Frame2.Visible = true;

  desktop.Click(page.frsCon_lblBack);
  EXPECT_FALSE(connection.frsCon_Frame1.Visible());
  EXPECT_TRUE(mail.frsCon_Frame2.Visible());
  desktop.Click(page.frsCon_lblBack);
  EXPECT_FALSE(mail.frsCon_Frame2.Visible());
  EXPECT_TRUE(page.IsOpen());
  desktop.Click(page.frsCon_lblBack);

  EXPECT_FALSE(page.IsOpen());
}

TEST_F(FirstConnection, Back_from_the_connection_step_returns_to_the_menu_and_a_second_back_closes_the_page) {
  OpenConnectionStep();

  desktop.Click(page.frsCon_lblBack);
  EXPECT_TRUE(page.IsOpen());
  EXPECT_FALSE(connection.frsCon_Frame1.Visible());
  desktop.Click(page.frsCon_lblBack);

  EXPECT_FALSE(page.IsOpen());
}

TEST_F(FirstConnection, The_page_is_closed_when_its_window_leaves_it) {
  OpenPage();

  page.Stop();

  EXPECT_FALSE(page.IsOpen());
}

TEST_F(FirstConnection, A_step_lies_over_the_whole_menu_and_leaves_the_keyboard_nothing_of_it) {
  OpenPage();
  page.menu.frsCon_lblConnectProb.Click = [] {};
  page.menu.frsCon_lblConnectProb.Enabled = true;
  const auto reached = [this] {
    std::vector<Text> names;
    const forms::Control* control = nullptr;
    do {
      control = forms::NextFocus(window, control, forms::TabDirection::Forwards);
      names.push_back(control->Name());
    } while (control != &page.frsCon_lblBack);
    return names;
  };
  EXPECT_EQ(reached(), (std::vector<Text>{u"frsCon_lblCaption(1)", u"frsCon_lblCaption(0)",
                                          u"frsCon_lblConnectProb", u"frsCon_lblBack"}));

  desktop.Click(page.menu.frsCon_lblCaption[1]);
  desktop.Click(connection.frsCon_lblModems[0]);
  FillConnection();
  EXPECT_EQ(reached(),
            (std::vector<Text>{u"frsCon_txtUsername", u"frsCon_txtPassword", u"frsCon_lblModems(0)",
                               u"frsCon_lblModems(1)", u"frsCon_lblModems(2)", u"frsCon_lblModems(3)",
                               u"frsCon_lblModems(4)", u"frsCon_cmdCreate", u"frsCon_lblBack"}));

  desktop.Click(page.frsCon_lblBack);
  desktop.Click(page.menu.frsCon_lblCaption[0]);
  desktop.Type(mail.frsCon_txtEmailUN, u"dana");
  EXPECT_EQ(reached(), (std::vector<Text>{u"frsCon_txtFullName", u"frsCon_txtEmailUN", u"frsCon_lblMails(0)",
                                          u"frsCon_cmdCreateEmail", u"frsCon_lblBack"}));
}

TEST_F(FirstConnection, Every_stop_of_the_keyboard_has_a_name_to_be_spoken) {
  OpenPage();
  for (const forms::Control* control : forms::ControlsIn(window)) {
    if (!control->TakesFocus()) continue;
    EXPECT_FALSE(Trimmed(forms::AccessibleOf(const_cast<forms::Control&>(*control)).name).empty())
        << ToUtf8(control->Name());
  }
  EXPECT_EQ(forms::AccessibleOf(connection.frsCon_txtPassword).name, u"סיסמה:");
  EXPECT_EQ(forms::AccessibleOf(connection.frsCon_lblModems[3]).role, forms::Role::Button);
}

TEST_F(FirstConnection, Hot_spots_have_no_text_as_the_pictures_below_them_bear_it) {
  EXPECT_EQ(page.menu.frsCon_PicMenu[0].Contents().ArtworkName(), "step_mail");
  EXPECT_EQ(page.menu.frsCon_PicMenu[1].Contents().ArtworkName(), "step_connection");
  for (std::size_t step = 0; step < 2; ++step) {
    EXPECT_EQ(page.menu.frsCon_lblCaption[step].Caption(), u"");
    EXPECT_TRUE(page.menu.frsCon_lblCaption[step].Transparent());
    EXPECT_EQ(page.menu.frsCon_lblCaption[step].Parent(), &page.menu.frsCon_PicMenu[step]);
  }
}

TEST_F(FirstConnection, The_mouse_over_a_picture_of_the_menu_shows_its_thirteen_lines_and_hides_the_others) {
  OpenPage();
  const auto shown = [this](std::size_t step) {
    return std::count_if(page.menu.frsCon_Lines.begin(), page.menu.frsCon_Lines.end(),
                         [step](const StepMenu::Lines& lines) { return lines[step].Visible(); });
  };
  EXPECT_EQ(shown(0), 0);
  EXPECT_EQ(shown(1), 0);

  desktop.MouseMove(page.menu.frsCon_PicMenu[0]);
  EXPECT_EQ(shown(0), 13);
  EXPECT_EQ(shown(1), 0);
  desktop.MouseMove(page.menu.frsCon_PicMenu[1]);
  EXPECT_EQ(shown(0), 0);
  EXPECT_EQ(shown(1), 13);
  desktop.MouseMove(page.menu.frsCon_lblCaption[1]);
  EXPECT_EQ(shown(1), 13);
  desktop.MouseMove(page.frameFirstConnection);
  EXPECT_EQ(shown(1), 0);
}

TEST_F(FirstConnection, The_lines_are_numbered_from_1_to_13_on_either_picture) {
  EXPECT_EQ(page.menu.frsCon_Lines.front()[0].Name(), u"frsCon_Line1(0)");
  EXPECT_EQ(page.menu.frsCon_Lines.back()[1].Name(), u"frsCon_Line13(1)");
  EXPECT_EQ(page.menu.frsCon_Lines.back()[1].Parent(), &page.menu.frsCon_PicMenu[1]);
}

TEST_F(FirstConnection, The_link_to_the_troubleshooter_is_there_for_whoever_answers_it) {
  OpenPage();
  EXPECT_EQ(page.menu.frsCon_lblConnectProb.Caption(), u"בעית חיבור");
  EXPECT_FALSE(desktop.Click(page.menu.frsCon_lblConnectProb));
  int clicks = 0;
  page.menu.frsCon_lblConnectProb.Click = [&] { ++clicks; };

  page.Design();
  OpenPage();
  desktop.Click(page.menu.frsCon_lblConnectProb);

  EXPECT_EQ(clicks, 1);
}

TEST_F(FirstConnection, Buttons_tell_whoever_does_the_work) {
  std::string told;
  page.CreateConnection = [&] { told += "connection "; };
  page.CreateMailAccount = [&] { told += "mail "; };
  OpenConnectionStep();
  FillConnection();
  desktop.Click(connection.frsCon_lblModems[0]);
  desktop.Click(connection.frsCon_cmdCreate);
  desktop.Click(page.frsCon_lblBack);
  desktop.Click(page.menu.frsCon_lblCaption[0]);
  desktop.Type(mail.frsCon_txtEmailUN, u"dana");
  desktop.Click(mail.frsCon_cmdCreateEmail);

  EXPECT_EQ(told, "connection mail ");
}

TEST_F(FirstConnection, The_hand_shows_over_what_can_be_pressed_and_over_nothing_else) {
  tokens = u"OE|MSO XP|MSO 2k|MSO 97|MSO 2k3|";
  OpenPage();
  for (forms::Label& hotSpot : page.menu.frsCon_lblCaption) EXPECT_EQ(HandsOver(hotSpot), 1);
  EXPECT_EQ(HandsOver(page.frsCon_lblBack), 1);
  for (forms::PictureBox& picture : page.menu.frsCon_PicMenu) EXPECT_EQ(HandsOver(picture), 0);
  EXPECT_EQ(HandsOver(page.frameFirstConnection), 0);
  OpenConnectionStep();
  FillConnection();
  desktop.Click(connection.frsCon_lblModems[0]);
  for (std::size_t row = 0; row < 5; ++row)
    for (forms::Control* part :
         std::vector<forms::Control*>{&connection.frsCon_imgModems[row], &connection.frsCon_lblModems[row],
                                      &connection.frsCon_lblModemBG[row]})
      EXPECT_EQ(HandsOver(*part), 1);
  EXPECT_EQ(HandsOver(connection.frsCon_cmdCreate), 1);
  EXPECT_EQ(HandsOver(connection.frsCon_Picture5), 1);
  EXPECT_EQ(HandsOver(connection.frsCon_Frame1), 0);
  OpenMailStep();
  desktop.Type(mail.frsCon_txtEmailUN, u"dana");
  for (std::size_t tile = 0; tile < 5; ++tile) {
    EXPECT_EQ(HandsOver(mail.frsCon_imgMails[tile]), 1);
    EXPECT_EQ(HandsOver(mail.frsCon_lblMails[tile]), 1);
    EXPECT_EQ(HandsOver(mail.frsCon_lblMailsBG[tile]), 0);
  }
  EXPECT_EQ(HandsOver(mail.frsCon_cmdCreateEmail), 1);
  EXPECT_EQ(HandsOver(mail.frsCon_Picture12), 1);
  EXPECT_EQ(HandsOver(mail.frsCon_Frame2), 0);
}

} // namespace
} // namespace quendra::provisioning
