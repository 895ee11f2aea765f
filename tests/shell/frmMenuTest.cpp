#include "shell/frmMenu.h"

#include "forms/view/Keyboard.h"
#include "shell/MenuFixture.h"

namespace quendra::shell {
namespace {

class MainWindow : public MenuTest {};

TEST_F(MainWindow, Its_window_has_a_fixed_border_a_minimise_box_and_no_maximise_box) {
  menu.Design();
  EXPECT_EQ(menu.Border, forms::BorderStyle::FixedSingle);
  EXPECT_TRUE(menu.MinimizeBox);
  EXPECT_FALSE(menu.MaximizeBox);
}

TEST_F(MainWindow, Moving_over_the_background_with_the_left_button_down_drags_the_window) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.picOut, forms::kLeftButton);
  EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"ReleaseCapture", "SendMessage frmMenu 0xA1 2 0"}));
}

TEST_F(MainWindow, Moving_over_the_background_drags_with_no_other_state_of_the_buttons) {
  ComeHome();
  desktop.Calls.clear();
  for (const int button : {0, 2, 3}) desktop.MouseMove(menu.picOut, button);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(MainWindow, The_welcome_lies_on_the_background_and_drags_like_it) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.lblWelcome, forms::kLeftButton);
  EXPECT_EQ(desktop.CountOf("SendMessage frmMenu 0xA1 2 0"), 1);
}

TEST_F(MainWindow, Every_label_that_acts_as_a_button_sets_the_hand_cursor) {
  ComeHome();
  ClickEntry(0);
  for (forms::Label* label :
       {&menu.Label1, &program.monitorPage.main_lblEndProcess, &program.monitorPage.main_lblJumpToPath,
        &program.monitorPage.main_cmdAddRemove, &program.monitorPage.main_cmdChecks,
        &program.monitorPage.main_cmdMemInfo, &program.monitorPage.reporting.main_cmdRpt}) {
    label->Enabled = true; // as it is once its action stands
    desktop.Calls.clear();
    EXPECT_TRUE(desktop.MouseMove(*label)) << ToUtf8(label->Name());
    EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"SetCursor 5"})) << ToUtf8(label->Name());
  }
  ClickEntry(1);
  desktop.Calls.clear();
  desktop.MouseMove(program.surfPage.surf_lblBack);
  ClickEntry(2);
  desktop.MouseMove(program.firstConnectionPage.frsCon_lblBack);
  EXPECT_EQ(desktop.CountOf("SetCursor 5"), 2);
}

TEST_F(MainWindow, No_hand_cursor_is_set_where_the_system_has_none) {
  desktop.CursorHandleToGive = forms::kNoCursor;
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.lblCaption[0]);
  desktop.MouseMove(menu.Label1);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(MainWindow, Its_activation_and_deactivation_keep_one_flag_which_the_surf_page_clears_too) {
  ComeHome();
  EXPECT_EQ(menu.InBackground, 0);
  desktop.Deactivate(menu);
  EXPECT_EQ(menu.InBackground, -1);
  desktop.Activate(menu);
  EXPECT_EQ(menu.InBackground, 0);
  desktop.Deactivate(menu);
  ClickEntry(1);
  EXPECT_EQ(menu.InBackground, 0);
}

TEST_F(MainWindow, Its_timers_stand_as_designed) {
  ComeHome();
  EXPECT_EQ(program.monitorPage.main_Timer1.Interval(), 1000);
  EXPECT_EQ(program.monitorPage.main_Timer2.Interval(), 1000);
  EXPECT_EQ(program.surfPage.surf_Timer1.Interval(), 100);
  desktop.Advance(10000);
  ClickEntry(0);
  ClickEntry(1);
  ClickEntry(2);
  EXPECT_FALSE(program.monitorPage.main_Timer1.Enabled());
  EXPECT_FALSE(program.monitorPage.main_Timer2.Enabled());
  EXPECT_FALSE(program.surfPage.surf_Timer1.Enabled());
}

TEST_F(MainWindow, Timer_2_has_no_handler) {
  EXPECT_FALSE(static_cast<bool>(program.monitorPage.main_Timer2.Tick));
}

TEST_F(MainWindow, The_surf_timer_would_fetch_the_table_and_sweep_it) {
  machine.AddProcess({700, 1, "client.exe", "C:\\client.exe"});
  machine.AddConnection({5, "10.0.0.5", 1025, "10.0.0.9", 80, 700});
  ComeHome();
  const int yields = desktop.YieldCount;
  program.surfPage.surf_Timer1.Enabled = true;
  desktop.Advance(100);
  EXPECT_EQ(machine.ipHelper.TablesFetched, 1);
  EXPECT_GT(desktop.YieldCount, yields);
  // The deletion itself stays disarmed.
  EXPECT_TRUE(machine.ipHelper.Deleted.empty());
}

TEST_F(MainWindow, The_surf_timer_sweeps_for_good_once_its_deletion_is_armed) {
  machine.AddProcess({700, 1, "client.exe", "C:\\client.exe"});
  machine.AddConnection({5, "10.0.0.5", 1025, "10.0.0.9", 80, 700});
  ComeHome();
  program.modProcPort.ConnectionDeleteEnabled = kTrue16;
  program.surfPage.surf_Timer1.Enabled = true;
  desktop.Advance(100);
  EXPECT_EQ(machine.ipHelper.Deleted.size(), 1U);
}

TEST_F(MainWindow, Label1_shapes_the_about_box_before_it_shows_it) {
  ComeHome();
  desktop.Calls.clear();
  EXPECT_TRUE(desktop.Click(menu.Label1));
  EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"CreateRoundRectRgn 0 0 420 280 10 10",
                                                     "SetWindowRgn frmAbout 1 0", "Show frmAbout"}));
  EXPECT_TRUE(program.frmAbout.Visible());
}

TEST_F(MainWindow, The_about_box_is_borderless_and_holds_its_picture) {
  ComeHome();
  desktop.Click(menu.Label1);
  EXPECT_EQ(program.frmAbout.Border, forms::BorderStyle::None);
  EXPECT_EQ(program.frmAbout.Caption(), u"About Quendra Monitor");
  EXPECT_EQ(program.frmAbout.Image1.Contents().ArtworkName(), "about");
}

TEST_F(MainWindow, The_main_window_stays_in_use_beside_the_about_box) {
  ComeHome();
  desktop.Click(menu.Label1);
  ClickEntry(1);
  EXPECT_TRUE(program.surfPage.frameSurfProb.Visible());
}

TEST_F(MainWindow, A_click_on_its_picture_closes_the_about_box) {
  ComeHome();
  desktop.Click(menu.Label1);
  EXPECT_TRUE(desktop.Click(program.frmAbout.Image1));
  EXPECT_FALSE(program.frmAbout.IsLoaded());
  EXPECT_FALSE(desktop.Ended);
  EXPECT_TRUE(desktop.Click(menu.Label1));
  EXPECT_TRUE(program.frmAbout.Visible());
}

TEST_F(MainWindow, Escape_and_Enter_close_the_about_box_as_the_click_does) {
  ComeHome();
  for (const int key : {forms::kEscapeKey, forms::kEnterKey}) {
    desktop.Click(menu.Label1);
    EXPECT_TRUE(desktop.KeyDown(program.frmAbout, key));
    EXPECT_FALSE(program.frmAbout.IsLoaded());
  }
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(MainWindow, Escape_does_nothing_in_the_main_window) {
  ComeHome();
  desktop.KeyDown(menu, forms::kEscapeKey);
  EXPECT_TRUE(menu.Visible());
  EXPECT_FALSE(desktop.Ended);
}

} // namespace
} // namespace quendra::shell
