#include "monitor/ProcessTableFixture.h"

namespace quendra::monitor {

// Rows that were there before.

TEST_F(ProcessTableTest, The_first_texts_of_a_silent_row_are_gone_after_the_second_pass) {
  AddProcesses({10});
  Pass();
  ASSERT_EQ(CellOf(10, kUploadCell), u"0");
  Pass();
  EXPECT_EQ(CellOf(10, kUploadCell), u"");
  EXPECT_EQ(CellOf(10, kDownloadCell), u"");
  EXPECT_EQ(CellOf(10, kTotalCell), u"");
}

TEST_F(ProcessTableTest, A_row_takes_no_new_name_path_class_or_icon_after_its_creation) {
  machine.AddProcess({10, 9999, "a.exe", "C:\\a.exe"});
  Pass();
  machine.AddVersionBlock("C:\\a.exe", {9, 4, 0xE4, 4}, {{"ProductName", "A"}});
  machine.SetIcon("C:\\a.exe", {1, 2, 3});
  machine.AddProcess({9999, 0, "services.exe", ""});
  Pass();
  EXPECT_EQ(CellOf(10, kApplicationCell), u"");
  EXPECT_EQ(ClassOf(10), u"");
  EXPECT_EQ(Row(10).SmallIcon(), 1);
  EXPECT_EQ(controls.main_ImList.Count(), 1);
}

TEST_F(ProcessTableTest, Totals_charged_while_a_pass_yields_count_in_the_next_pass) {
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  Pass();
  desktop.OnYield = [&] {
    if (desktop.YieldCount % 4 == 1) Charge(10, 3, 0);
  };
  Pass();
  ASSERT_EQ(CellOf(10, kUploadCell), u"");
  desktop.OnYield = {};
  Pass();
  EXPECT_EQ(CellOf(10, kUploadCell), u"03.00");
}

// Dead rows.

TEST_F(ProcessTableTest, A_dead_process_leaves_the_table) {
  AddProcesses({10, 20, 30});
  Pass();
  machine.EndProcess(10);
  Pass();
  EXPECT_EQ(Order(), (Ids{20, 30}));
}

TEST_F(ProcessTableTest, The_last_row_is_never_examined_and_a_dead_one_stays_there) {
  AddProcesses({10, 20});
  Pass();
  Pass();
  machine.EndProcess(20);
  Pass();
  Pass();
  EXPECT_EQ(Order(), (Ids{10, 20}));
}

TEST_F(ProcessTableTest, A_dead_last_row_leaves_once_another_row_sorts_below_it) {
  AddProcesses({10, 20});
  Pass();
  machine.EndProcess(20);
  // Nothing updates a dead row: its first "0" sorts above the live row's empty cell.
  Pass();
  ASSERT_EQ(Order(), (Ids{20, 10}));
  Pass();
  EXPECT_EQ(Order(), (Ids{10}));
}

TEST_F(ProcessTableTest, The_row_that_slides_into_the_place_of_a_removed_one_is_skipped) {
  AddProcesses({10, 20, 30, 40});
  Pass();
  machine.EndProcess(10);
  machine.EndProcess(20);
  Pass();
  EXPECT_FALSE(HasRow(10));
  EXPECT_TRUE(HasRow(20));
  Pass();
  EXPECT_FALSE(HasRow(20));
}

TEST_F(ProcessTableTest, Of_a_table_of_dead_rows_every_second_leaves_in_a_pass) {
  AddProcesses({10, 20, 30, 40, 50});
  Pass();
  for (const std::uint32_t id : {10, 20, 30, 40, 50}) machine.EndProcess(id);
  Pass();
  EXPECT_EQ(Order(), (Ids{20, 40, 50}));
  Pass();
  EXPECT_EQ(Order(), (Ids{40, 50}));
}

TEST_F(ProcessTableTest, A_single_dead_row_stays) {
  AddProcesses({10});
  Pass();
  machine.EndProcess(10);
  Pass();
  EXPECT_TRUE(HasRow(10));
}

// The order.

TEST_F(ProcessTableTest, Every_pass_sorts_by_the_download_rate_with_the_highest_first) {
  AddProcesses({10, 20, 30});
  Pass();
  Charge(20, 0, 30);
  Charge(30, 0, 4);
  Pass();
  EXPECT_EQ(Order(), (Ids{20, 30, 10}));
  EXPECT_EQ(list.SortKey(), 5);
  EXPECT_EQ(list.Order(), forms::SortOrder::Descending);
  EXPECT_TRUE(list.Sorted());
}

TEST_F(ProcessTableTest, The_sort_is_by_text_and_puts_1000_below_999) {
  AddProcesses({10, 20});
  Pass();
  Charge(10, 0, 1000);
  Charge(20, 0, 999);
  Pass();
  EXPECT_EQ(Order(), (Ids{20, 10}));
}

TEST_F(ProcessTableTest, A_column_that_the_user_picked_holds_until_the_next_pass) {
  AddProcesses({10, 20});
  Pass();
  table.main_ListView1_ColumnClick(2);
  ASSERT_EQ(list.SortKey(), 1);
  Pass();
  EXPECT_EQ(list.SortKey(), 5);
  EXPECT_EQ(list.Order(), forms::SortOrder::Descending);
}

TEST_F(ProcessTableTest, The_selection_follows_its_row_through_a_pass) {
  AddProcesses({10, 20});
  Pass();
  list.Select(&Row(10));
  Charge(20, 0, 5);
  Pass();
  ASSERT_EQ(Order(), (Ids{20, 10}));
  EXPECT_EQ(list.SelectedItem(), &Row(10));
}

} // namespace quendra::monitor
