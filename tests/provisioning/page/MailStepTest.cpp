#include "provisioning/FirstConnectionPageFixture.h"

#include "forms/view/ControlPlacement.h"

namespace quendra::provisioning {
namespace {

class MailTiles : public FirstConnectionPageTest {
 protected:
  void OpenWith(const Text& found) {
    tokens = found;
    OpenMailStep();
  }
  Rows Shown() const {
    Rows shown;
    for (std::size_t tile = 0; tile < 5; ++tile)
      if (mail.frsCon_lblMailsBG[tile].Visible()) shown.push_back(tile);
    return shown;
  }
  int LeftOf(std::size_t tile) const { return mail.frsCon_lblMailsBG[tile].Position().left; }
};

TEST_F(MailTiles, Bear_the_names_of_the_programs) {
  const std::vector<Text> captions{u" אאוטלוק אקספרס", u"מיקרוסופט אאוטלוק XP", u"מיקרוסופט אאוטלוק 2000",
                                   u"מיקרוסופט אאוטלוק 97", u"מיקרוסופט אאוטלוק 2003"};
  for (std::size_t tile = 0; tile < captions.size(); ++tile)
    EXPECT_EQ(mail.frsCon_lblMails[tile].Caption(), captions[tile]) << tile;
}

TEST_F(MailTiles, Of_a_machine_without_installed_products_are_the_one_of_Outlook_Express) {
  OpenWith(u"OE|");

  EXPECT_EQ(Shown(), Rows{0});
  EXPECT_EQ(LeftOf(0), 6525);
}

TEST_F(MailTiles, Of_Outlook_2003_alone_stand_beside_that_of_Outlook_Express) {
  OpenWith(u"OE|MSO 2k3|");

  EXPECT_EQ(Shown(), (Rows{0, 4}));
  EXPECT_EQ(LeftOf(0), 6525);
  EXPECT_EQ(LeftOf(4), 5259);
}

TEST_F(MailTiles, Of_a_token_that_comes_twice_end_at_its_second_place_and_leave_the_first_empty) {
  OpenWith(u"OE|MSO XP|MSO XP|");

  EXPECT_EQ(Shown(), (Rows{0, 1}));
  EXPECT_EQ(LeftOf(1), 3993);
}

TEST_F(MailTiles, Stand_in_the_order_of_the_tokens) {
  OpenWith(u"OE|MSO 2k3|MSO 97|MSO XP|MSO 2k|");

  EXPECT_EQ((std::vector<int>{LeftOf(0), LeftOf(4), LeftOf(3), LeftOf(1), LeftOf(2)}),
            (std::vector<int>{6525, 5259, 3993, 2727, 1461}));
}

TEST_F(MailTiles, Go_from_the_right_of_the_screen_to_its_left) {
  OpenWith(u"OE|MSO XP|");
  const auto leftOnScreen = [this](std::size_t tile) {
    const forms::Control& control = mail.frsCon_lblMailsBG[tile];
    return forms::PlaceOf(control.Position, control.Parent()->Position().width, {15, 15},
                          forms::PlacingOf(control))
        .corner.left;
  };

  EXPECT_EQ(leftOnScreen(0), 435);
  EXPECT_LT(leftOnScreen(1), leftOnScreen(0));
}

TEST_F(MailTiles, Take_no_place_for_empty_parts_and_for_tokens_that_stand_for_no_program) {
  OpenWith(u"||OE||mso xp|Other|OE2|MSO 2k");

  EXPECT_EQ(Shown(), (Rows{0, 2}));
  EXPECT_EQ(LeftOf(0), 6525);
  EXPECT_EQ(LeftOf(2), 5259);
}

TEST_F(MailTiles, Are_not_shown_without_tokens_or_anybody_who_tells_them) {
  OpenWith(u"");
  EXPECT_TRUE(Shown().empty());
  page.DetectMailClients = nullptr;

  OpenPage();

  EXPECT_TRUE(Shown().empty());
}

TEST_F(MailTiles, Are_not_hidden_again_at_a_second_opening) {
  OpenWith(u"OE|MSO XP|");
  page.Stop();

  OpenWith(u"OE|MSO 2k3|");

  EXPECT_EQ(Shown(), (Rows{0, 1, 4}));
  EXPECT_EQ(LeftOf(1), 5259);
  EXPECT_EQ(LeftOf(4), 5259);
}

TEST_F(MailTiles, Survive_a_machine_with_thousands_of_products) {
  Text many = u"OE|";
  for (int i = 0; i < 5000; ++i) many += u"MSO XP|";

  OpenWith(many);

  EXPECT_EQ(LeftOf(1), 6525 - 5000 * 1266);
}

TEST_F(MailTiles, Are_asked_for_at_each_opening) {
  int asked = 0;
  page.DetectMailClients = [&] {
    ++asked;
    return Text(u"OE|");
  };

  OpenPage();
  page.Stop();
  OpenPage();

  EXPECT_EQ(asked, 2);
}

TEST_F(MailTiles, Under_the_mouse_are_painted_one_at_a_time_and_leave_the_marks_alone) {
  OpenWith(u"OE|MSO XP|MSO 2k|MSO 97|MSO 2k3|");
  ShowAllMarks();
  for (std::size_t tile = 0; tile < 5; ++tile)
    for (forms::Control* part : std::vector<forms::Control*>{
             &mail.frsCon_imgMails[tile], &mail.frsCon_lblMails[tile], &mail.frsCon_lblMailsBG[tile]}) {
      desktop.MouseMove(mail.frsCon_Frame2);
      ASSERT_TRUE(Opaque(mailGrounds).empty());

      desktop.MouseMove(*part);

      EXPECT_EQ(Opaque(mailGrounds), Rows{tile}) << ToUtf8(part->Name());
      EXPECT_EQ(page.HoverMail, static_cast<int>(tile));
    }
  EXPECT_EQ(Marks(), (std::vector<bool>{true, true, true}));
}

TEST_F(MailTiles, Under_a_mouse_that_stays_are_painted_once) {
  OpenWith(u"OE|MSO XP|");
  desktop.MouseMove(mail.frsCon_lblMails[1]);
  mailGrounds[1].Transparent = true;

  desktop.MouseMove(mail.frsCon_lblMails[1]);

  EXPECT_TRUE(Opaque(mailGrounds).empty());
}

TEST_F(MailTiles, Of_a_number_that_no_tile_has_paint_nothing) {
  for (const std::int16_t tile : {std::int16_t{-2}, std::int16_t{5}, std::int16_t{32767}}) {
    page.HoverMailRow(tile);
    page.SelectMailRow(tile);
    EXPECT_TRUE(Opaque(mailGrounds).empty());
    EXPECT_TRUE(Green(mailGrounds).empty());
  }
}

TEST_F(MailTiles, Lose_the_hover_between_them_too) {
  OpenWith(u"OE|MSO XP|");
  desktop.MouseMove(mail.frsCon_lblMails[1]);

  desktop.MouseMove(mail.Tiles);

  EXPECT_TRUE(Opaque(mailGrounds).empty());
  EXPECT_EQ(page.HoverMail, -1);
}

TEST_F(MailTiles, Are_chosen_by_picture_and_caption_and_hide_the_mark_of_the_mail_alone) {
  OpenWith(u"OE|MSO XP|MSO 2k|MSO 97|MSO 2k3|");
  for (std::size_t tile = 0; tile < 5; ++tile)
    for (forms::Control* part :
         std::vector<forms::Control*>{&mail.frsCon_imgMails[tile], &mail.frsCon_lblMails[tile]}) {
      page.SelectMailRow(-1);
      ShowAllMarks();

      desktop.Click(*part);

      EXPECT_EQ(page.SelectedMail, static_cast<int>(tile)) << ToUtf8(part->Name());
      EXPECT_EQ(page.HoverMail, static_cast<int>(tile));
      EXPECT_EQ(Opaque(mailGrounds), Rows{tile});
      EXPECT_EQ(Green(mailGrounds), Rows{tile});
      EXPECT_EQ(White(mailGrounds).size(), 4u);
      EXPECT_EQ(Marks(), (std::vector<bool>{true, true, false}));
    }
}

TEST_F(MailTiles, Chosen_change_nothing_about_either_button) {
  OpenWith(u"OE|");

  desktop.Click(mail.frsCon_lblMails[0]);

  EXPECT_FALSE(mail.frsCon_cmdCreateEmail.Enabled());
  EXPECT_FALSE(connection.frsCon_cmdCreate.Enabled());
}

TEST_F(MailTiles, The_account_can_be_made_as_long_as_there_is_a_mail_user_name) {
  OpenWith(u"OE|");
  EXPECT_FALSE(mail.frsCon_cmdCreateEmail.Enabled());

  mail.frsCon_txtEmailUN.Value = u"dana";
  EXPECT_TRUE(mail.frsCon_cmdCreateEmail.Enabled());
  mail.frsCon_txtEmailUN.Value = Text();

  EXPECT_FALSE(mail.frsCon_cmdCreateEmail.Enabled());
}

} // namespace
} // namespace quendra::provisioning
