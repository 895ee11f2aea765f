#include "shell/MenuHighlight.h"

#include "shell/MenuFixture.h"

namespace quendra::shell {
namespace {

class Hovering : public MenuTest {};

TEST_F(Hovering, Hovering_a_button_highlights_it_alone) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor_hot", "menu_surf", "menu_connect"}));
  desktop.MouseMove(menu.PicMenu[2]);
  EXPECT_EQ(Pictures(), (std::vector<std::string>{"menu_monitor", "menu_surf", "menu_connect_hot"}));
}

TEST_F(Hovering, Hovering_a_button_leaves_the_lines_alone) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[4]);
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(EntriesWithLines(), (Entries{1, 4}));
}

TEST_F(Hovering, Hovering_the_second_row_shows_the_lines_of_that_entry_and_of_the_one_three_before) {
  ComeHome();
  EXPECT_EQ(EntriesWithLines(), (Entries{}));
  desktop.MouseMove(menu.PicMenu[3]);
  EXPECT_EQ(EntriesWithLines(), (Entries{0, 3}));
  desktop.MouseMove(menu.PicMenu[4]);
  EXPECT_EQ(EntriesWithLines(), (Entries{1, 4}));
  desktop.MouseMove(menu.PicMenu[5]);
  EXPECT_EQ(EntriesWithLines(), (Entries{2, 5}));
}

TEST_F(Hovering, Hovering_the_second_row_changes_no_picture) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[1]);
  desktop.MouseMove(menu.PicMenu[5]);
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
}

TEST_F(Hovering, Hovering_a_label_acts_like_its_picture_and_sets_the_cursor) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.lblCaption[1]);
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
  EXPECT_EQ(desktop.CountOf("SetCursor 5"), 1);
  desktop.MouseMove(menu.lblCaption[3]);
  EXPECT_EQ(EntriesWithLines(), (Entries{0, 3}));
  EXPECT_EQ(desktop.CountOf("SetCursor 5"), 2);
}

TEST_F(Hovering, Hovering_a_picture_sets_no_cursor) {
  ComeHome();
  desktop.Calls.clear();
  desktop.MouseMove(menu.PicMenu[1]);
  EXPECT_TRUE(desktop.Calls.empty());
}

TEST_F(Hovering, Moving_over_the_background_undoes_the_hovering) {
  ComeHome();
  desktop.MouseMove(menu.PicMenu[1]);
  desktop.MouseMove(menu.PicMenu[4]);
  desktop.MouseMove(menu.picOut);
  EXPECT_EQ(Pictures(), normal);
  EXPECT_EQ(EntriesWithLines(), (Entries{}));
}

TEST_F(Hovering, Once_a_page_was_chosen_hovering_changes_no_picture) {
  ComeHome();
  ClickEntry(1);
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(PictureOf(0), "menu_monitor");
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
  desktop.MouseMove(menu.picOut);
  EXPECT_EQ(PictureOf(1), "menu_surf_hot");
}

TEST_F(Hovering, Once_a_page_was_chosen_the_lines_still_follow_the_mouse) {
  ComeHome();
  ClickEntry(1);
  desktop.MouseMove(menu.PicMenu[5]);
  EXPECT_EQ(EntriesWithLines(), (Entries{2, 5}));
  desktop.MouseMove(menu.picOut);
  EXPECT_EQ(EntriesWithLines(), (Entries{}));
}

TEST_F(Hovering, A_chosen_page_is_never_unchosen_while_the_window_lives) {
  ComeHome();
  ClickEntry(1);
  desktop.Click(program.surfPage.surf_lblBack);
  EXPECT_TRUE(menu.PageChosen());
  ClickEntry(2);
  desktop.Click(program.firstConnectionPage.frsCon_lblBack);
  EXPECT_TRUE(menu.PageChosen());
  desktop.MouseMove(menu.PicMenu[0]);
  EXPECT_EQ(PictureOf(0), "menu_monitor");
}

} // namespace
} // namespace quendra::shell
