#include "forms/view/Accessible.h"
#include "forms/view/FormPlacement.h"
#include "forms/view/ListLayout.h"
#include "shell/ProgramFixture.h"

#include <functional>
#include <numeric>

namespace quendra::shell {
namespace {

/// What holds for every form at design time, whatever it looks like.
class Looks : public ProgramTest {
 protected:
  Looks() {
    for (forms::Form* form : forms) form->Design();
  }

  static void ForEach(const forms::Container& container, const std::function<void(forms::Control&)>& visit) {
    for (forms::Control* child : container.Children()) {
      visit(*child);
      if (const auto* inner = dynamic_cast<const forms::Container*>(child)) ForEach(*inner, visit);
    }
  }
  static bool HasPlace(const forms::Control& control) {
    return !dynamic_cast<const forms::Timer*>(&control) && !dynamic_cast<const forms::ImageList*>(&control) &&
           !dynamic_cast<const forms::Line*>(&control);
  }
  /// Hidden stores and the scratch picture lie anywhere.
  static bool IsStore(const forms::Control& control) {
    const std::string name = ToUtf8(control.Name());
    return name.starts_with("picMenu2") || name.starts_with("picMenu3") || name == "main_Pic";
  }
  static bool Overlap(const forms::Geometry& a, const forms::Geometry& b) {
    return a.left < b.left + b.width && b.left < a.left + a.width && a.top < b.top + b.height &&
           b.top < a.top + a.height;
  }
  /// A panel covers what its page shows while it is open.
  static bool IsOverlay(const forms::Control& control) {
    const Text& name = control.Name();
    return name == u"frmSurf_frameAdvanced" || name == u"frsCon_Frame1" || name == u"frsCon_Frame2";
  }
  /// Rows stand on it.
  static bool IsGround(const forms::Control& control) {
    return control.Name().starts_with(u"frsCon_lblModemBG");
  }
  /// Rules whose width is told in twips.
  static bool IsRule(const forms::Control& control) { return control.Name().starts_with(u"surf_picLine"); }
  /// No two controls of a page lie on each other.
  static void ExpectApart(const forms::Container& page) {
    std::vector<const forms::Control*> placed;
    for (const forms::Control* child : page.Children())
      if (HasPlace(*child) && !IsStore(*child) && !IsOverlay(*child) && !IsGround(*child))
        placed.push_back(child);
    for (std::size_t i = 0; i < placed.size(); ++i)
      for (std::size_t j = i + 1; j < placed.size(); ++j)
        EXPECT_FALSE(Overlap(placed[i]->Position, placed[j]->Position))
            << ToUtf8(placed[i]->Name()) << " and " << ToUtf8(placed[j]->Name());
  }

  std::vector<forms::Form*> forms{&program.frmSplash,
                                  &program.frmMenu,
                                  &program.frmAbout,
                                  &program.frmPortsChecks,
                                  &program.connection.frmConnectProb,
                                  &program.connection.frmNetworkAdapters};
};

TEST_F(Looks, Every_control_has_a_size_and_lies_within_its_container) {
  for (forms::Form* form : forms)
    ForEach(*form, [](forms::Control& control) {
      if (!HasPlace(control) || IsStore(control)) return;
      const forms::Geometry place = control.Position;
      const forms::Geometry room = control.Parent()->Position();
      const std::string name = ToUtf8(control.Name());
      EXPECT_GT(place.width, 0) << name;
      EXPECT_GT(place.height, 0) << name;
      EXPECT_GE(place.left, 0) << name;
      EXPECT_GE(place.top, 0) << name;
      EXPECT_LE(place.left + place.width, room.width) << name;
      EXPECT_LE(place.top + place.height, room.height) << name;
    });
}

TEST_F(Looks, Every_place_falls_on_whole_pixels) {
  for (forms::Form* form : forms)
    ForEach(*form, [](forms::Control& control) {
      if (IsRule(control)) return;
      const forms::Geometry place = control.Position;
      for (const int twips : {place.left, place.top, place.width, place.height})
        EXPECT_EQ(twips % 15, 0) << ToUtf8(control.Name());
    });
}

TEST_F(Looks, The_controls_of_a_page_lie_beside_each_other) {
  ExpectApart(program.monitorPage.frameMain);
  ExpectApart(program.monitorPage.adapters.main_Frame1);
  ExpectApart(program.surfPage.frameSurfProb);
  ExpectApart(program.surfPage.advanced.frmSurf_frameAdvanced);
  ExpectApart(program.frmPortsChecks);
  ExpectApart(program.firstConnectionPage.frameFirstConnection);
  ExpectApart(program.firstConnectionPage.connection.frsCon_Frame1);
  ExpectApart(program.firstConnectionPage.mail.frsCon_Frame2);
  ExpectApart(program.connection.frmNetworkAdapters);
}

TEST_F(Looks, The_menu_stays_clear_of_the_pages) {
  for (const forms::PictureBox& picture : program.frmMenu.PicMenu)
    EXPECT_FALSE(Overlap(picture.Position, program.monitorPage.frameMain.Position)) << ToUtf8(picture.Name());
}

TEST_F(Looks, Every_menu_label_covers_its_picture_and_lets_it_shine_through) {
  for (std::size_t entry = 0; entry < 6; ++entry) {
    const forms::Geometry picture = program.frmMenu.PicMenu[entry].Position;
    const forms::Geometry label = program.frmMenu.lblCaption[entry].Position;
    EXPECT_EQ(label, (forms::Geometry{0, 0, picture.width, picture.height})) << entry;
    EXPECT_TRUE(program.frmMenu.lblCaption[entry].Transparent()) << entry;
    EXPECT_EQ(program.frmMenu.lblCaption[entry].Parent(), &program.frmMenu.PicMenu[entry]);
  }
}

TEST_F(Looks, The_table_shows_all_its_columns_beside_a_scroll_bar_and_wide_enough_to_be_read) {
  ComeHome();
  ClickEntry(0);
  std::vector<int> told;
  for (const forms::ColumnHeader& column : program.monitorPage.table.main_ListView1.Columns())
    told.push_back(column.width / 15);
  constexpr int kScrollBarAndFrame = 17 + 2;
  const int room = program.monitorPage.table.main_ListView1.Position().width / 15 - kScrollBarAndFrame;

  const std::vector<int> shown = forms::ColumnWidths(told, room);

  EXPECT_LE(std::accumulate(shown.begin(), shown.end(), 0), room);
  for (std::size_t i = 0; i < told.size(); ++i) EXPECT_GE(shown[i], told[i] * 8 / 10) << i;
}

TEST_F(Looks, Every_form_with_its_frame_has_room_on_a_screen_of_1024_by_768_with_a_panel) {
  constexpr forms::Extent kRoom{1024 - 2 * 4, 768 - 40 - 36 - 4};
  for (forms::Form* form : forms) {
    const forms::Geometry place = form->Position;
    EXPECT_EQ(forms::FittingScale({place.width / 15, place.height / 15}, kRoom).scale, 1)
        << ToUtf8(form->Name());
  }
}

TEST_F(Looks, Every_form_reads_from_right_to_left_and_every_control_has_its_own_name) {
  for (forms::Form* form : forms) {
    EXPECT_TRUE(form->RightToLeft);
    std::vector<Text> names;
    ForEach(*form, [&](forms::Control& control) { names.push_back(control.Name()); });
    std::sort(names.begin(), names.end());
    EXPECT_EQ(std::adjacent_find(names.begin(), names.end()), names.end()) << ToUtf8(form->Name());
  }
}

TEST_F(Looks, Every_label_that_acts_as_a_button_has_a_name_to_be_called_by) {
  for (forms::Form* form : forms)
    ForEach(*form, [](forms::Control& control) {
      const auto* label = dynamic_cast<const forms::Label*>(&control);
      if (label && label->IsButton()) {
        EXPECT_FALSE(forms::AccessibleOf(control).name.empty()) << ToUtf8(label->Name());
      }
    });
}

TEST_F(Looks, The_parts_of_a_row_lie_on_its_ground) {
  const provisioning::ConnectionPanel& panel = program.firstConnectionPage.connection;
  for (std::size_t row = 0; row < 5; ++row)
    for (const forms::Control* part : {static_cast<const forms::Control*>(&panel.frsCon_imgModems[row]),
                                       static_cast<const forms::Control*>(&panel.frsCon_lblModems[row])})
      for (std::size_t ground = 0; ground < 5; ++ground)
        EXPECT_EQ(Overlap(part->Position, panel.frsCon_lblModemBG[ground].Position), ground == row)
            << ToUtf8(part->Name());
}

TEST_F(Looks, Every_control_returns_to_its_design_at_the_next_load) {
  frmMenu& menu = program.frmMenu;
  ComeHome();
  desktop.Show(program.frmSplash);
  ClickEntry(0);
  desktop.MouseMove(menu.PicMenu[4]);
  menu.Tag = Text(u"not close");
  desktop.CloseBox(menu);
  desktop.Click(program.frmSplash.Label2);
  EXPECT_FALSE(program.monitorPage.frameMain.Visible());
  EXPECT_FALSE(menu.linMenu1[4].Visible());
  EXPECT_FALSE(menu.PageChosen());
  EXPECT_EQ(menu.PicMenu[0].Contents().ArtworkName(), "menu_monitor");
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Count(), 0);
  EXPECT_EQ(program.monitorPage.table.main_ImList.Count(), 1);
  EXPECT_EQ(program.monitorPage.table.main_headersIL.Count(), 2);
  EXPECT_EQ(program.monitorPage.adapters.main_cmbAdapters.ListCount(), 0);
}

} // namespace
} // namespace quendra::shell
