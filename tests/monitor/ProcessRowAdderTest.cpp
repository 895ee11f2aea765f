#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

namespace {

struct NewRow : MonitorFixture {
  int Images() { return controls.main_ImList.Count(); }
};

} // namespace

TEST_F(NewRow, Holds_key_name_path_and_application) {
  machine.AddProcess({1234, 9999, "a.exe", "C:\\dir\\a.exe"});
  machine.AddVersionBlock("C:\\dir\\a.exe", {9, 4, 0xE4, 4}, {{"ProductName", "An Application"}});
  Pass();
  ASSERT_EQ(list.Row(1).Key(), u"p1234");
  EXPECT_EQ(CellOf(1234, kApplicationCell), u"An Application");
  EXPECT_EQ(CellOf(1234, kNameCell), u"a.exe");
  EXPECT_EQ(Row(1234).CellTag(kNameCell), Variant(u"C:\\dir\\a.exe"));
}

TEST_F(NewRow, Has_nine_cells_with_their_first_texts_and_tags) {
  machine.AddProcess({10, 9999, "a.exe", ""});
  Pass();
  ASSERT_EQ(Row(10).CellCount(), 9);
  for (const int cell : {4, 5, 6, 7}) EXPECT_EQ(CellOf(10, cell), u"0") << cell;
  for (const int cell : {8, 9}) EXPECT_EQ(CellOf(10, cell), u"") << cell;
  for (const int cell : {4, 5, 6, 7, 8, 9}) EXPECT_EQ(Row(10).CellTag(cell), Variant(0.0)) << cell;
}

TEST_F(NewRow, Is_marked_as_alive) {
  machine.AddProcess({10, 9999, "a.exe", ""});
  Pass();
  EXPECT_EQ(Row(10).CellTag(kApplicationCell), Variant(u"1"));
}

TEST_F(NewRow, Keeps_the_tick_of_its_creation_with_class_and_ports) {
  machine.AddProcess({10, 9999, "a.exe", ""});
  machine.SetTick(0x80000000);
  table.RefreshProcessTable(u"");
  EXPECT_EQ(Row(10).CellTag(kClassCell), Variant(-2147483648.0));
  EXPECT_EQ(Row(10).CellTag(kPortsCell), Variant(-2147483648.0));
}

TEST_F(NewRow, Takes_its_name_up_to_the_first_NUL) {
  machine.AddProcess({10, 9999, std::string("a.exe\0rest", 10), ""});
  Pass();
  EXPECT_EQ(CellOf(10, kNameCell), u"a.exe");
}

TEST_F(NewRow, Takes_a_shorter_name_behind_a_longer_one_without_its_rest) {
  machine.AddProcess({10, 9999, "longername.exe", ""});
  machine.AddProcess({20, 9999, "b.exe", ""});
  Pass();
  EXPECT_EQ(CellOf(20, kNameCell), u"b.exe");
}

TEST_F(NewRow, Reads_a_name_in_the_systems_code_page) {
  machine.AddProcess({10, 9999, ToCodePage(u"שלום.exe"), ""});
  Pass();
  EXPECT_EQ(CellOf(10, kNameCell), u"שלום.exe");
}

TEST(ExeName, Without_a_NUL_is_the_whole_field) {
  platform::Processes::Entry entry;
  entry.exeFile.fill('x');
  EXPECT_EQ(ExeNameOf(entry), Text(260, u'x'));
}

TEST_F(NewRow, Of_process_0_has_no_path_no_application_and_the_default_icon) {
  machine.AddProcess({0, 0, "[System Process]", "C:\\idle.exe"});
  machine.SetIcon("C:\\idle.exe", {1});
  Pass();
  EXPECT_EQ(CellOf(0, kNameCell), u"[System Process]");
  EXPECT_EQ(CellOf(0, kApplicationCell), u"");
  EXPECT_EQ(Row(0).CellTag(kNameCell), Variant(u""));
  EXPECT_EQ(Row(0).SmallIcon(), 1);
  EXPECT_TRUE(machine.processes.OpenCalls.empty());
}

TEST_F(NewRow, Of_a_process_without_modules_has_no_path_and_no_application) {
  machine.AddProcess({4, 9999, "System", ""});
  Pass();
  EXPECT_EQ(Row(4).CellTag(kNameCell), Variant(u""));
  EXPECT_EQ(CellOf(4, kApplicationCell), u"");
  EXPECT_EQ(machine.icons.Extracted, 0);
}

// Icons.

TEST_F(NewRow, Shows_the_icon_of_its_file) {
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  Pass();
  ASSERT_EQ(Images(), 2);
  EXPECT_EQ(Row(10).SmallIcon(), 2);
  EXPECT_EQ(controls.main_ImList.Item(2).Tag, u"C:\\a.exe");
  EXPECT_EQ(controls.main_ImList.Item(2).picture, desktop.ImageOf(controls.table.main_Pic));
}

TEST_F(NewRow, Draws_its_icon_at_the_origin_in_32_by_32_pixels_on_a_clear_box) {
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  machine.AddProcess({20, 9999, "b.exe", "C:\\b.exe"});
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  machine.SetIcon("C:\\b.exe", {1, 2, 3, 4});
  Pass();
  const auto& drawing = desktop.DrawingOf(controls.table.main_Pic);
  ASSERT_EQ(drawing.size(), 1u);
  EXPECT_TRUE(drawing[0].starts_with("Icon 0,0 32x32 of 4 bytes")) << drawing[0];
}

TEST_F(NewRow, Destroys_the_icon_it_was_given) {
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  Pass();
  EXPECT_EQ(machine.icons.Extracted, 1);
  EXPECT_EQ(machine.icons.Live(), 0);
}

TEST_F(NewRow, Of_a_file_without_an_icon_shows_the_default) {
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  Pass();
  EXPECT_EQ(Row(10).SmallIcon(), 1);
  EXPECT_EQ(Images(), 1);
}

TEST_F(NewRow, Adds_an_image_even_when_its_path_has_one_and_shows_the_first) {
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  machine.AddProcess({20, 9999, "a.exe", "C:\\a.exe"});
  Pass();
  EXPECT_EQ(Images(), 3);
  EXPECT_EQ(Row(10).SmallIcon(), 2);
  EXPECT_EQ(Row(20).SmallIcon(), 2);
}

TEST_F(NewRow, Leaves_its_image_behind_when_its_process_has_gone) {
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  machine.AddProcess({20, 9999, "b.exe", ""});
  Pass();
  machine.EndProcess(10);
  Pass();
  ASSERT_FALSE(HasRow(10));
  EXPECT_EQ(Images(), 2);
}

TEST_F(NewRow, Of_a_known_file_that_gives_no_icon_now_shows_the_image_from_before) {
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  Pass();
  machine.icons = platform::simulated::SimulatedIcons();
  machine.AddProcess({20, 9999, "a.exe", "C:\\a.exe"});
  Pass();
  EXPECT_EQ(Images(), 2);
  EXPECT_EQ(Row(20).SmallIcon(), 2);
}

TEST_F(NewRow, Of_a_file_whose_icon_is_no_image_adds_the_clear_box) {
  machine.SetIcon("C:\\a.exe", {});
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  Pass();
  EXPECT_EQ(Images(), 2);
  EXPECT_EQ(Row(10).SmallIcon(), 2);
  EXPECT_EQ(machine.icons.Live(), 0);
}

// Classes.

TEST_F(NewRow, Is_a_service_a_users_or_the_systems_by_its_parent) {
  machine.AddProcess({4, 9999, "System", ""});
  machine.AddProcess({100, 9999, "services.exe", ""});
  machine.AddProcess({200, 9999, "explorer.exe", ""});
  machine.AddProcess({11, 100, "a.exe", ""});
  machine.AddProcess({12, 200, "b.exe", ""});
  machine.AddProcess({13, 4, "c.exe", ""});
  Pass();
  EXPECT_EQ(ClassOf(11), u"Service");
  EXPECT_EQ(ClassOf(12), u"User");
  EXPECT_EQ(ClassOf(13), u"System");
}

TEST_F(NewRow, Is_the_systems_below_any_of_the_five) {
  const std::array<const char*, 5> names{"system", "smss.exe", "winlogon.exe", "csrss.exe", "lsass.exe"};
  for (std::uint32_t i = 0; i < names.size(); ++i) {
    machine.AddProcess({100 + i, 9999, names[i], ""});
    machine.AddProcess({200 + i, 9998, "clear.exe", ""});
  }
  machine.AddProcess({300, 9999, "services.exe", ""});
  for (std::uint32_t i = 0; i < names.size(); ++i) {
    machine.AddProcess({400 + i, 100 + i, "child.exe", ""});
    machine.AddProcess({500 + i, 300, "between.exe", ""});
  }
  Pass();
  for (std::uint32_t i = 0; i < names.size(); ++i) {
    EXPECT_EQ(fileInfo.SystemPids[i], 100 + i);
    EXPECT_EQ(ClassOf(400 + i), u"System") << names[i];
  }
}

TEST_F(NewRow, Of_the_kernel_and_of_process_1_is_the_systems_in_a_snapshot_as_Linux_gives_it) {
  machine.AddProcess({2, 2, "System", ""});
  machine.AddProcess({1, 2, "services.exe", ""});
  machine.AddProcess({3, 2, "kworker", ""});
  machine.AddProcess({400, 1, "sshd", ""});
  machine.AddProcess({500, 1, "explorer.exe", ""});
  machine.AddProcess({600, 500, "browser", ""});
  Pass();
  for (const std::uint32_t id : {1u, 2u, 3u}) EXPECT_EQ(ClassOf(id), u"System") << id;
  for (const std::uint32_t id : {400u, 500u}) EXPECT_EQ(ClassOf(id), u"Service") << id;
  EXPECT_EQ(ClassOf(600), u"User");
}

TEST_F(NewRow, Of_an_unknown_parent_takes_the_class_of_the_row_added_before_it) {
  machine.AddProcess({100, 9999, "services.exe", ""});
  machine.AddProcess({11, 100, "a.exe", ""});
  machine.AddProcess({12, 9999, "b.exe", ""});
  Pass();
  EXPECT_EQ(ClassOf(12), u"Service");
}

TEST_F(NewRow, Of_an_unknown_parent_has_no_class_when_it_is_the_first_of_a_pass) {
  machine.AddProcess({100, 9999, "services.exe", ""});
  machine.AddProcess({11, 100, "a.exe", ""});
  Pass();
  machine.AddProcess({12, 9999, "b.exe", ""});
  Pass();
  ASSERT_EQ(ClassOf(11), u"Service");
  EXPECT_EQ(ClassOf(12), u"");
}

TEST_F(NewRow, Takes_no_class_from_a_row_that_the_pass_only_updates) {
  machine.AddProcess({100, 9999, "services.exe", ""});
  machine.AddProcess({11, 100, "a.exe", ""});
  Pass();
  machine.AddProcess({12, 9999, "b.exe", ""});
  machine.AddProcess({13, 100, "c.exe", ""});
  machine.AddProcess({14, 9999, "d.exe", ""});
  Pass();
  EXPECT_EQ(ClassOf(12), u"");
  EXPECT_EQ(ClassOf(14), u"Service");
}

TEST_F(NewRow, Listed_before_its_parent_in_the_first_pass_is_not_recognised) {
  machine.AddProcess({11, 100, "a.exe", ""});
  machine.AddProcess({100, 9999, "services.exe", ""});
  Pass();
  Pass();
  EXPECT_EQ(ClassOf(11), u"");
}

TEST_F(NewRow, Is_recognised_by_a_parent_that_an_earlier_pass_has_seen) {
  machine.AddProcess({100, 9999, "services.exe", ""});
  Pass();
  machine.AddProcess({11, 100, "a.exe", ""});
  Pass();
  EXPECT_EQ(ClassOf(11), u"Service");
}

TEST_F(NewRow, Of_a_parent_with_id_0_equals_a_well_known_id_not_seen_yet) {
  machine.AddProcess({0, 0, "[System Process]", ""});
  Pass();
  EXPECT_EQ(ClassOf(0), u"Service");
}

TEST_F(NewRow, That_is_well_known_and_its_own_parent_is_recognised_at_once) {
  machine.AddProcess({100, 100, "explorer.exe", ""});
  Pass();
  EXPECT_EQ(ClassOf(100), u"User");
}

TEST_F(NewRow, Keeps_the_id_of_a_well_known_process_that_has_gone_until_another_comes) {
  machine.AddProcess({100, 9999, "explorer.exe", ""});
  machine.AddProcess({5, 9999, "last.exe", ""});
  Pass();
  machine.EndProcess(100);
  Pass();
  EXPECT_EQ(fileInfo.ExplorerPid, 100u);
  machine.AddProcess({200, 9999, "Explorer.EXE", ""});
  Pass();
  EXPECT_EQ(fileInfo.ExplorerPid, 200u);
}

} // namespace quendra::monitor
