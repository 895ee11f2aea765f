#include "shell/frmSplash.h"

#include "forms/view/Keyboard.h"
#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

class Splash : public ProgramTest {
 protected:
  frmSplash& splash = program.frmSplash;

  bool AgreementShown() const {
    return splash.picOut.Visible() && splash.picBuffer.Visible() && splash.picBackBuffer.Visible();
  }
  bool AgreementHidden() const {
    return !splash.picOut.Visible() && !splash.picBuffer.Visible() && !splash.picBackBuffer.Visible();
  }
};

TEST_F(Splash, Is_what_the_program_starts_with_and_all_it_starts) {
  program.Start();
  EXPECT_TRUE(splash.Visible());
  EXPECT_FALSE(program.frmMenu.IsLoaded());
  EXPECT_FALSE(program.frmAbout.IsLoaded());
  EXPECT_TRUE(machine.Calls.empty());
}

TEST_F(Splash, Bears_its_texts) {
  program.Start();
  EXPECT_EQ(splash.lblProductName.Caption(), u"זלמר בינלאומי@נט");
  EXPECT_EQ(splash.lblPlatform.Caption(), u"ל-Windows XP");
  EXPECT_EQ(splash.lblVersion.Caption(), u"גירסה 1.1");
  EXPECT_EQ(splash.lblWarning.Caption(),
            u"הרצת התוכנה פירושה הסכמה מפורשת לתנאים המצורפים. ניתן לעיין בתנאים בלחיצה כאן.");
  EXPECT_EQ(splash.Label1.Caption(), u"כאן");
  EXPECT_EQ(splash.Label2.Caption(), u"המשך");
  EXPECT_EQ(splash.Label3.Caption(), u"סגור");
  EXPECT_FALSE(splash.lblCompany.Caption().empty());
  EXPECT_FALSE(splash.lblCopyright.Caption().empty());
}

TEST_F(Splash, Has_its_timer_enabled_with_1_ms_at_design_time) {
  splash.Design();
  EXPECT_TRUE(splash.ReDrawTimer.Enabled());
  EXPECT_EQ(splash.ReDrawTimer.Interval(), 1);
}

TEST_F(Splash, Has_its_pictures_hidden_and_in_pixels_at_design_time) {
  splash.Design();
  EXPECT_TRUE(AgreementHidden());
  EXPECT_EQ(splash.picOut.ScaleMode, forms::ScaleMode::Pixels);
  EXPECT_EQ(splash.picBuffer.ScaleMode, forms::ScaleMode::Pixels);
  EXPECT_EQ(splash.picBackBuffer.ScaleMode, forms::ScaleMode::Pixels);
}

TEST_F(Splash, Hides_the_agreement_at_its_load_so_that_the_timer_never_ticks_before_it_is_shown) {
  program.Start();
  EXPECT_TRUE(AgreementHidden());
  EXPECT_FALSE(splash.ReDrawTimer.Enabled());
  desktop.Calls.clear();
  desktop.Advance(1000);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Splash, Stores_the_hand_cursor_at_its_load) {
  program.Start();
  EXPECT_EQ(desktop.CountOf("LoadCursor 32649"), 1);
}

TEST_F(Splash, Wraps_the_agreement_into_the_buffers_width_less_30_pixels) {
  program.Start();
  // 552 pixels of 8 a letter: 65 letters a line at most, as every line has a blank.
  EXPECT_EQ(splash.Lines().LineCount(), 7);
  EXPECT_EQ(splash.Lines().Line(1), u"זלמר בינלאומי@נט");
  EXPECT_EQ(splash.Lines().Line(2), u"____________________________");
  for (int number = 1; number <= splash.Lines().LineCount(); ++number)
    EXPECT_LE(splash.Lines().Line(number).size() * 8, 552U - 30U) << number;
}

TEST_F(Splash, Has_the_link_lie_on_the_last_word_of_the_warning) {
  program.Start();
  const forms::Geometry warning = splash.lblWarning.Position;
  const forms::Geometry link = splash.Label1.Position;
  // 74 letters of 8 pixels stand before the word, which has 3; one pixel is room.
  EXPECT_EQ(link.left, warning.left + 74 * 8 * 15);
  EXPECT_EQ(link.width, (3 * 8 + 1) * 15);
  EXPECT_EQ(link.top, warning.top);
  EXPECT_EQ(link.height, warning.height);
}

TEST_F(Splash, Has_what_the_user_sees_of_the_agreement_in_front_of_its_buffers) {
  const auto& children = splash.Children();
  const auto place = [&](const forms::Control& control) {
    return std::find(children.begin(), children.end(), &control);
  };
  EXPECT_LT(place(splash.picBuffer), place(splash.picOut));
  EXPECT_LT(place(splash.picBackBuffer), place(splash.picOut));
  splash.Design();
  EXPECT_EQ(splash.picBuffer.Position(), splash.picOut.Position());
  EXPECT_EQ(splash.picBackBuffer.Position(), splash.picOut.Position());
}

TEST_F(Splash, Rolls_the_agreement_every_5_ms_when_the_link_is_clicked) {
  program.Start();
  EXPECT_TRUE(desktop.Click(splash.Label1));
  EXPECT_TRUE(AgreementShown());
  EXPECT_EQ(splash.ReDrawTimer.Interval(), 5);
  EXPECT_TRUE(splash.ReDrawTimer.Enabled());
  EXPECT_EQ(splash.Roll().ScrollOffset(), 248);
  desktop.Advance(50);
  EXPECT_EQ(splash.Roll().ScrollOffset(), 238);
}

TEST_F(Splash, Hides_the_agreement_when_it_is_clicked_while_it_rolls) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Advance(50);
  EXPECT_TRUE(desktop.Click(splash.picOut));
  EXPECT_TRUE(AgreementHidden());
  EXPECT_FALSE(splash.ReDrawTimer.Enabled());
}

TEST_F(Splash, Hides_the_agreement_when_it_is_clicked_after_its_roll) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Advance(60000);
  EXPECT_TRUE(AgreementShown());
  EXPECT_TRUE(desktop.Click(splash.picOut));
  EXPECT_TRUE(AgreementHidden());
}

TEST_F(Splash, Starts_the_roll_anew_at_each_click_on_the_link) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Advance(500);
  desktop.Click(splash.Label1);
  EXPECT_EQ(splash.Roll().ScrollOffset(), 248);
}

TEST_F(Splash, Sets_the_hand_cursor_over_its_three_clickable_labels) {
  program.Start();
  for (forms::Label* label : {&splash.Label1, &splash.Label2, &splash.Label3}) {
    desktop.Calls.clear();
    EXPECT_TRUE(desktop.MouseMove(*label));
    EXPECT_EQ(desktop.CountOf("SetCursor 5"), 1) << ToUtf8(label->Name());
  }
}

TEST_F(Splash, Leaves_the_cursor_where_the_system_has_no_hand) {
  desktop.CursorHandleToGive = forms::kNoCursor;
  program.Start();
  desktop.Calls.clear();
  desktop.MouseMove(splash.Label2);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Splash, Goes_on_at_once_without_a_look_at_the_agreement) {
  program.Start();
  EXPECT_TRUE(desktop.Click(splash.Label2));
  EXPECT_TRUE(program.frmMenu.Visible());
  EXPECT_FALSE(splash.IsLoaded());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(Splash, Leaves_no_timer_running_when_it_goes_on_during_a_roll) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Advance(50);
  desktop.Click(splash.Label2);
  desktop.Calls.clear();
  desktop.Advance(1000);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Splash, Ends_the_program_when_it_is_closed_and_the_main_window_never_loads) {
  program.Start();
  EXPECT_TRUE(desktop.Click(splash.Label3));
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_FALSE(program.frmMenu.IsLoaded());
  EXPECT_TRUE(machine.Calls.empty());
}

TEST_F(Splash, Has_its_button_that_goes_on_first_in_the_tab_order_and_its_link_last) {
  program.Start();
  EXPECT_EQ(forms::FirstFocus(splash), &splash.Label2);
  std::vector<forms::Control*> buttons;
  for (forms::Control* control : forms::TabOrder(splash))
    if (control->Click && dynamic_cast<forms::Label*>(control)) buttons.push_back(control);
  EXPECT_EQ(buttons, (std::vector<forms::Control*>{&splash.Label2, &splash.Label3, &splash.Label1}));
}

TEST_F(Splash, Goes_on_with_Enter) {
  program.Start();
  EXPECT_TRUE(desktop.KeyDown(splash, forms::kEnterKey));
  EXPECT_TRUE(program.frmMenu.Visible());
}

TEST_F(Splash, Ends_the_program_with_Escape_as_its_close_button_does) {
  program.Start();
  EXPECT_TRUE(desktop.KeyDown(splash, forms::kEscapeKey));
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
}

TEST_F(Splash, Hides_the_agreement_with_Escape_while_it_rolls_and_stays) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Advance(50);
  EXPECT_TRUE(desktop.KeyDown(splash, forms::kEscapeKey));
  EXPECT_TRUE(AgreementHidden());
  EXPECT_FALSE(splash.ReDrawTimer.Enabled());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(Splash, Ends_the_program_with_a_second_Escape_behind_the_agreement) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Advance(60000);
  desktop.KeyDown(splash, forms::kEscapeKey);
  EXPECT_TRUE(AgreementHidden());
  desktop.KeyDown(splash, forms::kEscapeKey);
  EXPECT_TRUE(desktop.Ended);
}

TEST_F(Splash, Closes_with_Escape_after_the_agreement_was_clicked_away) {
  program.Start();
  desktop.Click(splash.Label1);
  desktop.Click(splash.picOut);
  desktop.KeyDown(splash, forms::kEscapeKey);
  EXPECT_TRUE(desktop.Ended);
}

} // namespace
} // namespace quendra::shell
