#include "shell/frmMenu.h"

#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

class Menu : public ProgramTest {
 protected:
  frmMenu& menu = program.frmMenu;

  std::string PictureOf(std::size_t button) const { return menu.PicMenu[button].Contents().ArtworkName(); }
  std::vector<std::string> Pictures() const { return {PictureOf(0), PictureOf(1), PictureOf(2)}; }
  /// The entries whose lines show; both lines of a group go together.
  std::vector<std::size_t> EntriesWithLines() const {
    std::vector<std::size_t> entries;
    for (std::size_t entry = 0; entry < menu.linMenu1.size(); ++entry) {
      EXPECT_EQ(menu.linMenu1[entry].Visible(), menu.linMenu2[entry].Visible()) << entry;
      if (menu.linMenu1[entry].Visible()) entries.push_back(entry);
    }
    return entries;
  }
  std::vector<bool> VisiblePages() const {
    return {menu.frameMain.Visible(), menu.frameSurfProb.Visible(), menu.frameFirstConnection.Visible()};
  }

  const std::vector<std::string> normal{"menu_monitor", "menu_surf", "menu_connect"};
  using Entries = std::vector<std::size_t>;
  using Visible = std::vector<bool>;
};

// Pages.

TEST_F(Menu, Its_first_three_labels_open_monitor_surf_problems_and_first_connection) {
  ComeHome();
  ClickEntry(0);
  EXPECT_EQ(VisiblePages(), (Visible{true, false, false}));
  ClickEntry(1);
  EXPECT_EQ(VisiblePages(), (Visible{false, true, false}));
  ClickEntry(2);
  EXPECT_EQ(VisiblePages(), (Visible{false, false, true}));
}

TEST_F(Menu, Label_5_behaves_as_label_0_label_4_as_1_and_label_3_as_2) {
  const std::size_t pairs[][2] = {{5, 0}, {4, 1}, {3, 2}};
  ComeHome();
  for (const auto& [second, first] : pairs) {
    ClickEntry(first);
    const Visible pages = VisiblePages();
    const auto pictures = Pictures();
    ClickEntry((first + 1) % 3);
    machine.Calls.clear();
    ClickEntry(second);
    EXPECT_EQ(VisiblePages(), pages) << second;
    EXPECT_EQ(Pictures(), pictures) << second;
  }
}

TEST_F(Menu, Label_5_starts_the_monitor_as_label_0_does) {
  ComeHome();
  ClickEntry(0);
  const std::vector<std::string> started(machine.Calls.begin() + 2, machine.Calls.end());
  ClickEntry(1);
  machine.Calls.clear();
  ClickEntry(5);
  EXPECT_EQ(machine.Calls, started);
}

TEST_F(Menu, The_second_row_bears_the_names_of_the_first_in_reverse_order) {
  menu.Design();
  EXPECT_EQ(menu.lblCaption[3].Caption(), menu.lblCaption[2].Caption());
  EXPECT_EQ(menu.lblCaption[4].Caption(), menu.lblCaption[1].Caption());
  EXPECT_EQ(menu.lblCaption[5].Caption(), menu.lblCaption[0].Caption());
}

TEST_F(Menu, A_number_without_a_page_resets_the_menu_and_does_no_more) {
  MenuHighlight highlight({menu.PicMenu, menu.picMenu2, menu.picMenu3, menu.linMenu1, menu.linMenu2});
  int calls = 0;
  const auto count = [&] { ++calls; };
  MenuPages pages({{{menu.frameMain, count, count},
                    {menu.frameSurfProb, count, count},
                    {menu.frameFirstConnection, count, count}}},
                  menu.lblCaption, highlight);
  menu.Design();
  menu.lblCaption[4].Visible = false;
  for (const int entry : {-1, 6, 100}) pages.Choose(entry);
  EXPECT_EQ(calls, 0);
  EXPECT_TRUE(menu.lblCaption[4].Visible());
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_TRUE(pages.PageChosen);
}

TEST_F(Menu, The_button_of_the_open_page_is_highlighted_and_the_others_are_not) {
  ComeHome();
  ClickEntry(1);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor", "menu_surf_hot", "menu_connect"}));
  ClickEntry(3);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor", "menu_surf", "menu_connect_hot"}));
  ClickEntry(0);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor_hot", "menu_surf", "menu_connect"}));
}

TEST_F(Menu, The_opened_page_comes_to_the_front) {
  ComeHome();
  ClickEntry(0);
  EXPECT_EQ(menu.Children().back(), &menu.frameMain);
  ClickEntry(1);
  EXPECT_EQ(menu.Children().back(), &menu.frameSurfProb);
}

TEST_F(Menu, A_page_is_started_before_it_is_shown_brought_to_front_and_its_button_highlighted) {
  ComeHome();
  ChangeLog log;
  log.Watch(menu.frameSurfProb);
  log.Watch(menu.PicMenu[1]);
  menu.Form_Deactivate();
  ClickEntry(1);
  EXPECT_EQ(log.Lines, (std::vector<std::string>{"show frameSurfProb", "to front frameSurfProb",
                                                 "picture of PicMenu(1)"}));
  EXPECT_EQ(menu.InBackground(), 0);
}

TEST_F(Menu, Choosing_the_page_that_shows_stops_and_restarts_it) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  ClickEntry(0);
  EXPECT_TRUE(menu.frameMain.Visible());
  const auto stopped = std::find(machine.Calls.begin(), machine.Calls.end(), "CloseChannel");
  const auto started = std::find(machine.Calls.begin(), machine.Calls.end(), "vpBegin 1000");
  ASSERT_NE(stopped, machine.Calls.end());
  ASSERT_NE(started, machine.Calls.end());
  EXPECT_LT(stopped, started);
}

TEST_F(Menu, Leaving_the_monitor_for_another_page_stops_its_capture) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  ClickEntry(2);
  EXPECT_EQ(machine.Calls,
            (std::vector<std::string>{"vpEnd", "Sleep 300", "StopEvents", "ReleaseChannel", "CloseChannel"}));
}

// resetButtons.

TEST_F(Menu, Resetting_shows_the_labels_then_the_normal_pictures_then_stops_and_hides_the_pages) {
  ComeHome();
  ClickEntry(0);
  for (forms::Label& label : menu.lblCaption) label.Visible = false;
  ChangeLog log;
  for (forms::Label& label : menu.lblCaption) log.Watch(label);
  for (forms::PictureBox& picture : menu.PicMenu) log.Watch(picture);
  log.Watch(menu.frameMain);
  menu.resetButtons();
  EXPECT_EQ(log.Lines,
            (std::vector<std::string>{"show lblCaption(0)", "show lblCaption(1)", "show lblCaption(2)",
                                      "show lblCaption(3)", "show lblCaption(4)", "show lblCaption(5)",
                                      "picture of PicMenu(0)", "hide frameMain"}));
}

TEST_F(
    Menu,
    Resetting_stops_visible_pages_in_the_order_monitor_surf_problems_first_connection_and_then_hides_them) {
  MenuHighlight highlight({menu.PicMenu, menu.picMenu2, menu.picMenu3, menu.linMenu1, menu.linMenu2});
  ChangeLog log;
  const auto stop = [&](const char* page) { return [&log, page] { log.Lines.push_back(page); }; };
  MenuPages pages({{{menu.frameMain, [] {}, stop("stop monitor")},
                    {menu.frameSurfProb, [] {}, stop("stop surf")},
                    {menu.frameFirstConnection, [] {}, stop("stop first connection")}}},
                  menu.lblCaption, highlight);
  menu.Design();
  for (forms::Frame* frame : {&menu.frameMain, &menu.frameSurfProb, &menu.frameFirstConnection}) {
    frame->Visible = true;
    log.Watch(*frame);
  }
  pages.resetButtons();
  EXPECT_EQ(log.Lines,
            (std::vector<std::string>{"stop monitor", "stop surf", "stop first connection", "hide frameMain",
                                      "hide frameSurfProb", "hide frameFirstConnection"}));
}

TEST_F(Menu, Resetting_stops_no_page_that_is_hidden) {
  ComeHome();
  machine.Calls.clear();
  menu.resetButtons();
  EXPECT_TRUE(machine.Calls.empty());
}

TEST_F(Menu, All_pages_are_hidden_at_design_time_and_the_stores_of_pictures_too) {
  menu.Design();
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  for (std::size_t button = 0; button < 3; ++button) {
    EXPECT_FALSE(menu.picMenu2[button].Visible());
    EXPECT_FALSE(menu.picMenu3[button].Visible());
    EXPECT_NE(menu.picMenu2[button].Contents(), menu.picMenu3[button].Contents());
  }
}

// Hovering.

TEST_F(Menu, Hovering_a_button_highlights_it_alone) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor_hot", "menu_surf", "menu_connect"}));
  desktop.MouseMove(menu.PicMenu[2]);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor", "menu_surf", "menu_connect_hot"}));
}

TEST_F(Menu, Hovering_a_button_leaves_the_lines_alone) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[4]);
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(EntriesWithLines(), (Entries{1, 4}));
}

TEST_F(Menu, Hovering_the_second_row_shows_the_lines_of_that_entry_and_of_the_one_three_before) {
  ComeHome();
  EXPECT_EQ(EntriesWithLines(), (Entries{}));
  desktop.MouseMove(menu.PicMenu[3]);
  EXPECT_EQ(EntriesWithLines(), (Entries{0, 3}));
  desktop.MouseMove(menu.PicMenu[4]);
  EXPECT_EQ(EntriesWithLines(), (Entries{1, 4}));
  desktop.MouseMove(menu.PicMenu[5]);
  EXPECT_EQ(EntriesWithLines(), (Entries{2, 5}));
}

TEST_F(Menu, Hovering_the_second_row_changes_no_picture) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[1]);
  desktop.MouseMove(menu.PicMenu[5]);
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
}

TEST_F(Menu, Hovering_a_label_acts_like_its_picture_and_sets_the_cursor) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.lblCaption[1]);
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
  EXPECT_EQ(desktop.CountOf("SetCursor 5"), 1);
  desktop.MouseMove(menu.lblCaption[3]);
  EXPECT_EQ(EntriesWithLines(), (Entries{0, 3}));
  EXPECT_EQ(desktop.CountOf("SetCursor 5"), 2);
}

TEST_F(Menu, Hovering_a_picture_sets_no_cursor) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.PicMenu[1]);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Menu, Moving_over_the_background_undoes_the_hovering) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[1]);
  desktop.MouseMove(menu.PicMenu[4]);
  desktop.MouseMove(menu.picOut);
  EXPECT_EQ(Pictures(), normal);
  EXPECT_EQ(EntriesWithLines(), (Entries{}));
}

TEST_F(Menu, Once_a_page_was_chosen_hovering_changes_no_picture) {
  ComeHome();
  ClickEntry(1);
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(PictureOf(0), "menu_monitor");
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
  desktop.MouseMove(menu.picOut);
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
}

TEST_F(Menu, Once_a_page_was_chosen_the_lines_still_follow_the_mouse) {
  ComeHome();
  ClickEntry(1);
  desktop.MouseMove(menu.PicMenu[5]);
  EXPECT_EQ(EntriesWithLines(), (Entries{2, 5}));
  desktop.MouseMove(menu.picOut);
  EXPECT_EQ(EntriesWithLines(), (Entries{}));
}

TEST_F(Menu, A_chosen_page_is_never_unchosen_while_the_window_lives) {
  ComeHome();
  ClickEntry(1);
  desktop.Click(menu.surf_lblBack);
  EXPECT_TRUE(menu.PageChosen());
  ClickEntry(2);
  desktop.Click(menu.frsCon_lblBack);
  EXPECT_TRUE(menu.PageChosen());
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(PictureOf(0), "menu_monitor");
}

// Back labels.

TEST_F(Menu, Back_from_surf_problems_hides_the_page_and_puts_the_menu_back) {
  ComeHome();
  ClickEntry(1);
  EXPECT_TRUE(desktop.Click(menu.surf_lblBack));
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_EQ(Pictures(), normal);
}

TEST_F(Menu, Back_from_the_first_connection_hides_the_page_and_leaves_its_button_as_it_is) {
  ComeHome();
  ClickEntry(2);
  EXPECT_TRUE(desktop.Click(menu.frsCon_lblBack));
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_EQ(PictureOf(2), "menu_connect_hot");
}

TEST_F(Menu, The_back_labels_say_so) {
  menu.Design();
  EXPECT_EQ(menu.surf_lblBack.Caption(), u"חזרה");
  EXPECT_EQ(menu.frsCon_lblBack.Caption(), u"חזרה");
}

// The window.

TEST_F(Menu, Its_window_has_a_fixed_border_a_minimise_box_and_no_maximise_box) {
  menu.Design();
  EXPECT_EQ(menu.Border, forms::BorderStyle::FixedSingle);
  EXPECT_TRUE(menu.MinimizeBox);
  EXPECT_FALSE(menu.MaximizeBox);
}

TEST_F(Menu, Moving_over_the_background_with_the_left_button_down_drags_the_window) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.picOut, forms::kLeftButton);
  EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"ReleaseCapture", "SendMessage frmMenu 0xA1 2 0"}));
}

TEST_F(Menu, Moving_over_the_background_drags_with_no_other_state_of_the_buttons) {
  ComeHome();
  desktop.Calls.clear();
  for (const int button : {0, 2, 3}) desktop.MouseMove(menu.picOut, button);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Menu, The_welcome_lies_on_the_background_and_drags_like_it) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.lblWelcome, forms::kLeftButton);
  EXPECT_EQ(desktop.CountOf("SendMessage frmMenu 0xA1 2 0"), 1);
}

TEST_F(Menu, Every_label_that_acts_as_a_button_sets_the_hand_cursor) {
  ComeHome();
  ClickEntry(0);
  for (forms::Label* label :
       {&menu.Label1, &menu.main_lblEndProcess, &menu.main_lblJumpToPath, &menu.main_cmdAddRemove,
        &menu.main_cmdChecks, &menu.main_cmdMemInfo, &menu.main_cmdRpt}) {
    desktop.Calls.clear();
    EXPECT_TRUE(desktop.MouseMove(*label)) << ToUtf8(label->Name());
    EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"SetCursor 5"})) << ToUtf8(label->Name());
  }
  ClickEntry(1);
  desktop.Calls.clear();
  desktop.MouseMove(menu.surf_lblBack);
  ClickEntry(2);
  desktop.MouseMove(menu.frsCon_lblBack);
  EXPECT_EQ(desktop.CountOf("SetCursor 5"), 2);
}

TEST_F(Menu, No_hand_cursor_is_set_where_the_system_has_none) {
  desktop.CursorHandleToGive = 0;
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.lblCaption[0]);
  desktop.MouseMove(menu.Label1);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Menu, Its_activation_and_deactivation_keep_one_flag_which_the_surf_page_clears_too) {
  ComeHome();
  EXPECT_EQ(menu.InBackground(), 0);
  desktop.Deactivate(menu);
  EXPECT_EQ(menu.InBackground(), -1);
  desktop.Activate(menu);
  EXPECT_EQ(menu.InBackground(), 0);
  desktop.Deactivate(menu);
  ClickEntry(1);
  EXPECT_EQ(menu.InBackground(), 0);
}

TEST_F(Menu, Its_timers_stand_as_designed) {
  ComeHome();
  EXPECT_EQ(menu.main_Timer1.Interval(), 1000);
  EXPECT_EQ(menu.main_Timer2.Interval(), 1000);
  EXPECT_EQ(menu.surf_Timer1.Interval(), 100);
  desktop.Advance(10000);
  ClickEntry(0);
  ClickEntry(1);
  ClickEntry(2);
  EXPECT_FALSE(menu.main_Timer1.Enabled());
  EXPECT_FALSE(menu.main_Timer2.Enabled());
  EXPECT_FALSE(menu.surf_Timer1.Enabled());
}

TEST_F(Menu, Timer_2_has_no_handler) { EXPECT_FALSE(static_cast<bool>(menu.main_Timer2.Tick)); }

TEST_F(Menu, The_surf_timer_would_fetch_the_table_and_sweep_it) {
  machine.AddProcess({700, 1, "client.exe", "C:\\client.exe"});
  machine.AddConnection({5, "10.0.0.5", 1025, "10.0.0.9", 80, 700});
  ComeHome();
  const int yields = desktop.YieldCount;
  menu.surf_Timer1.Enabled = true;
  desktop.Advance(100);
  EXPECT_EQ(machine.ipHelper.TablesFetched, 1);
  EXPECT_GT(desktop.YieldCount, yields);
  // The deletion itself stays disarmed.
  EXPECT_TRUE(machine.ipHelper.Deleted.empty());
}

TEST_F(Menu, The_surf_timer_sweeps_for_good_once_its_deletion_is_armed) {
  machine.AddProcess({700, 1, "client.exe", "C:\\client.exe"});
  machine.AddConnection({5, "10.0.0.5", 1025, "10.0.0.9", 80, 700});
  ComeHome();
  program.modProcPort.ConnectionDeleteEnabled = kTrue16;
  menu.surf_Timer1.Enabled = true;
  desktop.Advance(100);
  EXPECT_EQ(machine.ipHelper.Deleted.size(), 1U);
}

// About box.

TEST_F(Menu, Label1_shapes_the_about_box_before_it_shows_it) {
  ComeHome();
  desktop.Calls.clear();
  EXPECT_TRUE(desktop.Click(menu.Label1));
  EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"CreateRoundRectRgn 0 0 420 280 10 10",
                                                     "SetWindowRgn frmAbout 1 0", "Show frmAbout"}));
  EXPECT_TRUE(program.frmAbout.Visible());
}

TEST_F(Menu, The_about_box_is_borderless_and_holds_its_picture) {
  ComeHome();
  desktop.Click(menu.Label1);
  EXPECT_EQ(program.frmAbout.Border, forms::BorderStyle::None);
  EXPECT_EQ(program.frmAbout.Caption(), u"About Quendra Monitor");
  EXPECT_EQ(program.frmAbout.Image1.Contents().ArtworkName(), "about");
}

TEST_F(Menu, The_main_window_stays_in_use_beside_the_about_box) {
  ComeHome();
  desktop.Click(menu.Label1);
  ClickEntry(1);
  EXPECT_TRUE(menu.frameSurfProb.Visible());
}

TEST_F(Menu, A_click_on_its_picture_closes_the_about_box) {
  ComeHome();
  desktop.Click(menu.Label1);
  EXPECT_TRUE(desktop.Click(program.frmAbout.Image1));
  EXPECT_FALSE(program.frmAbout.IsLoaded());
  EXPECT_FALSE(desktop.Ended);
  EXPECT_TRUE(desktop.Click(menu.Label1));
  EXPECT_TRUE(program.frmAbout.Visible());
}

// IP panel.

TEST_F(Menu, Ctrl_with_I_tells_the_addresses) {
  machine.hostNames.Addresses = {"192.168.1.7", "10.0.0.5"};
  machine.ipHelper.Adapters = {{"eth0", "Network card", {"10.0.0.5"}, {"", "10.0.0.138"}}};
  ComeHome();
  EXPECT_TRUE(menu.KeyPreview);
  EXPECT_TRUE(desktop.KeyDown(menu, u'I', forms::kCtrl));
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"נתוני IP:\r\n1: 10.0.0.5\r\n2: 10.0.0.138\r\n3: 192.168.1.7");
  EXPECT_EQ(desktop.Boxes[0].flags, 0x180040);
  EXPECT_EQ(desktop.Boxes[0].title, u"זלמר בינלאומי@נט");
}

TEST_F(Menu, Ctrl_with_the_key_of_a_small_i_or_of_the_Hebrew_layout_tells_the_addresses_too) {
  ComeHome();
  desktop.KeyDown(menu, u'i', forms::kCtrl);
  desktop.KeyDown(menu, u'ן', forms::kCtrl);
  EXPECT_EQ(desktop.Boxes.size(), 2U);
}

TEST_F(Menu, The_same_keys_without_Ctrl_alone_do_nothing) {
  ComeHome();
  for (const int shift : {0, 1, 3, 4, 6, 7})
    for (const int key : {int{u'I'}, int{u'i'}, int{u'ן'}}) desktop.KeyDown(menu, key, shift);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(Menu, Ctrl_with_any_other_key_does_nothing) {
  ComeHome();
  for (const int key : {int{u'H'}, int{u'J'}, int{u'ו'}, 0, 0xD9}) desktop.KeyDown(menu, key, forms::kCtrl);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(Menu, Addresses_that_cannot_be_read_are_empty_in_the_panel) {
  machine.hostNames.FailName = true;
  ComeHome();
  desktop.KeyDown(menu, u'I', forms::kCtrl);
  EXPECT_EQ(desktop.Boxes.at(0).text, u"נתוני IP:\r\n1: \r\n2: \r\n3: ");
}

TEST_F(Menu, A_host_with_one_address_has_none_before_it) {
  machine.hostNames.Addresses = {"10.0.0.5"};
  ComeHome();
  desktop.KeyDown(menu, u'I', forms::kCtrl);
  EXPECT_EQ(desktop.Boxes.at(0).text, u"נתוני IP:\r\n1: 10.0.0.5\r\n2: \r\n3: ");
}

} // namespace
} // namespace quendra::shell
