#include "shell/MenuPages.h"

#include "shell/MenuFixture.h"

namespace quendra::shell {
namespace {

class Pages : public MenuTest {};

TEST_F(Pages, Its_first_three_labels_open_monitor_surf_problems_and_first_connection) {
  ComeHome();
  ClickEntry(0);
  EXPECT_EQ(VisiblePages(), (Visible{true, false, false}));
  ClickEntry(1);
  EXPECT_EQ(VisiblePages(), (Visible{false, true, false}));
  ClickEntry(2);
  EXPECT_EQ(VisiblePages(), (Visible{false, false, true}));
}

TEST_F(Pages, Label_5_behaves_as_label_0_label_4_as_1_and_label_3_as_2) {
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

TEST_F(Pages, Label_5_starts_the_monitor_as_label_0_does) {
  ComeHome();
  ClickEntry(0);
  const std::vector<std::string> started(machine.Calls.begin() + 2, machine.Calls.end());
  ClickEntry(2);
  machine.Calls.clear();
  ClickEntry(5);
  EXPECT_EQ(machine.Calls, started);
}

TEST_F(Pages, The_second_row_bears_the_names_of_the_first_in_reverse_order) {
  menu.Design();
  EXPECT_EQ(menu.lblCaption[3].Caption(), menu.lblCaption[2].Caption());
  EXPECT_EQ(menu.lblCaption[4].Caption(), menu.lblCaption[1].Caption());
  EXPECT_EQ(menu.lblCaption[5].Caption(), menu.lblCaption[0].Caption());
}

TEST_F(Pages, A_number_without_a_page_resets_the_menu_and_does_no_more) {
  MenuHighlight highlight({menu.PicMenu, menu.picMenu2, menu.picMenu3, menu.linMenu1, menu.linMenu2});
  MenuPages pages(menu.lblCaption, highlight);
  int calls = 0;
  for (forms::Page* page : AllPages()) {
    page->Start = page->Stop = [&] { ++calls; };
    pages.Add(*page);
  }
  menu.Design();
  menu.lblCaption[4].Visible = false;
  for (const int entry : {-1, 6, 100}) pages.Choose(static_cast<std::size_t>(entry));
  EXPECT_EQ(calls, 0);
  EXPECT_TRUE(menu.lblCaption[4].Visible());
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_TRUE(pages.PageChosen);
}

TEST_F(Pages, The_button_of_the_open_page_is_highlighted_and_the_others_are_not) {
  ComeHome();
  ClickEntry(1);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor", "menu_surf_hot", "menu_connect"}));
  ClickEntry(3);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor", "menu_surf", "menu_connect_hot"}));
  ClickEntry(0);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor_hot", "menu_surf", "menu_connect"}));
}

TEST_F(Pages, The_opened_page_comes_to_the_front) {
  ComeHome();
  ClickEntry(0);
  EXPECT_EQ(menu.Children().back(), &program.monitorPage.frameMain);
  ClickEntry(1);
  EXPECT_EQ(menu.Children().back(), &program.surfPage.frameSurfProb);
}

TEST_F(Pages, A_page_is_started_before_it_is_shown_brought_to_front_and_its_button_highlighted) {
  ComeHome();
  ChangeLog log;
  log.Watch(program.surfPage.frameSurfProb);
  log.Watch(menu.PicMenu[1]);
  menu.Form_Deactivate();
  ClickEntry(1);
  EXPECT_EQ(log.Lines, (std::vector<std::string>{"show frameSurfProb", "to front frameSurfProb",
                                                 "picture of PicMenu(1)"}));
  EXPECT_EQ(menu.InBackground, 0);
}

TEST_F(Pages, Choosing_the_page_that_shows_stops_and_restarts_it) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  ClickEntry(0);
  EXPECT_TRUE(program.monitorPage.frameMain.Visible());
  const auto stopped = std::find(machine.Calls.begin(), machine.Calls.end(), "CloseChannel");
  const auto started = std::find(machine.Calls.begin(), machine.Calls.end(), "vpBegin 1000");
  ASSERT_NE(stopped, machine.Calls.end());
  ASSERT_NE(started, machine.Calls.end());
  EXPECT_LT(stopped, started);
}

TEST_F(Pages, Leaving_the_monitor_for_another_page_releases_its_sockets_and_stops_its_capture) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  ClickEntry(2);
  EXPECT_EQ(machine.Calls, (std::vector<std::string>{"WSACleanup", "vpEnd", "Sleep 300", "StopEvents",
                                                     "ReleaseChannel", "CloseChannel"}));
}

TEST_F(Pages, Resetting_shows_the_labels_then_the_normal_pictures_then_stops_and_hides_the_pages) {
  ComeHome();
  ClickEntry(0);
  for (forms::Label& label : menu.lblCaption) label.Visible = false;
  ChangeLog log;
  for (forms::Label& label : menu.lblCaption) log.Watch(label);
  for (forms::PictureBox& picture : menu.PicMenu) log.Watch(picture);
  log.Watch(program.monitorPage.frameMain);
  menu.resetButtons();
  EXPECT_EQ(log.Lines,
            (std::vector<std::string>{"show lblCaption(0)", "show lblCaption(1)", "show lblCaption(2)",
                                      "show lblCaption(3)", "show lblCaption(4)", "show lblCaption(5)",
                                      "picture of PicMenu(0)", "hide frameMain"}));
}

TEST_F(Pages, Resetting_stops_pages_in_the_order_monitor_surf_problems_first_connection_then_hides_them) {
  MenuHighlight highlight({menu.PicMenu, menu.picMenu2, menu.picMenu3, menu.linMenu1, menu.linMenu2});
  ChangeLog log;
  MenuPages pages(menu.lblCaption, highlight);
  for (forms::Page* page : AllPages()) {
    page->Stop = [&log, page] { log.Lines.push_back("stop " + ToUtf8(page->frame.Name())); };
    pages.Add(*page);
  }
  menu.Design();
  for (forms::Page* page : AllPages()) {
    page->frame.Visible = true;
    log.Watch(page->frame);
  }
  pages.resetButtons();
  EXPECT_EQ(log.Lines,
            (std::vector<std::string>{"stop frameMain", "stop frameSurfProb", "stop frameFirstConnection",
                                      "hide frameMain", "hide frameSurfProb", "hide frameFirstConnection"}));
}

TEST_F(Pages, A_window_that_unloads_stops_the_monitor_page_when_it_is_open_and_no_other) {
  ComeHome();
  std::vector<const forms::Page*> stopped;
  for (forms::Page* page : AllPages()) page->Stop = [&stopped, page] { stopped.push_back(page); };
  for (forms::Page* page : AllPages()) page->frame.Visible = true;
  desktop.CloseBox(menu);
  EXPECT_EQ(stopped, (std::vector<const forms::Page*>{&program.monitorPage}));
}

TEST_F(Pages, A_menu_without_pages_opens_none) {
  MenuHighlight highlight({menu.PicMenu, menu.picMenu2, menu.picMenu3, menu.linMenu1, menu.linMenu2});
  MenuPages pages(menu.lblCaption, highlight);
  menu.Design();
  for (std::size_t entry = 0; entry < kEntryCount; ++entry) pages.Choose(entry);
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_EQ(Pictures(), normal);
}

TEST_F(Pages, Resetting_stops_no_page_that_is_hidden) {
  ComeHome();
  machine.Calls.clear();
  menu.resetButtons();
  EXPECT_TRUE(machine.Calls.empty());
}

TEST_F(Pages, All_pages_are_hidden_at_design_time_and_the_stores_of_pictures_too) {
  menu.Design();
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  for (std::size_t button = 0; button < 3; ++button) {
    EXPECT_FALSE(menu.picMenu2[button].Visible());
    EXPECT_FALSE(menu.picMenu3[button].Visible());
    EXPECT_NE(menu.picMenu2[button].Contents(), menu.picMenu3[button].Contents());
  }
}

TEST_F(Pages, Back_from_surf_problems_hides_the_page_and_puts_the_menu_back) {
  ComeHome();
  ClickEntry(1);
  EXPECT_TRUE(desktop.Click(program.surfPage.surf_lblBack));
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_EQ(Pictures(), normal);
}

TEST_F(Pages, Back_from_the_first_connection_hides_the_page_and_leaves_its_button_as_it_is) {
  ComeHome();
  ClickEntry(2);
  EXPECT_TRUE(desktop.Click(program.firstConnectionPage.frsCon_lblBack));
  EXPECT_EQ(VisiblePages(), (Visible{false, false, false}));
  EXPECT_EQ(PictureOf(2), "menu_connect_hot");
}

TEST_F(Pages, The_back_labels_say_so) {
  menu.Design();
  EXPECT_EQ(program.surfPage.surf_lblBack.Caption(), u"חזרה");
  EXPECT_EQ(program.firstConnectionPage.frsCon_lblBack.Caption(), u"חזרה");
}

} // namespace
} // namespace quendra::shell
