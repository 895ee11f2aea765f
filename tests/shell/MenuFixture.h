#pragma once

#include "shell/ProgramFixture.h"

namespace quendra::shell {

/// The main window and what its tests ask of it.
class MenuTest : public ProgramTest {
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
    return {program.monitorPage.frameMain.Visible(), program.surfPage.frameSurfProb.Visible(),
            program.firstConnectionPage.frameFirstConnection.Visible()};
  }

  std::vector<forms::Page*> AllPages() {
    return {&program.monitorPage, &program.surfPage, &program.firstConnectionPage};
  }

  const std::vector<std::string> normal{"menu_monitor", "menu_surf", "menu_connect"};
  using Entries = std::vector<std::size_t>;
  using Visible = std::vector<bool>;
};

} // namespace quendra::shell
