#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

namespace {

struct TableColumns : MonitorFixture {
  const forms::ColumnHeader& Column(int header) {
    return list.Columns().at(static_cast<std::size_t>(header - 1));
  }

  void AddNamed(std::uint32_t id, const char* name) { machine.AddProcess({id, 9999, name, ""}); }
};

} // namespace

TEST_F(TableColumns, The_table_is_prepared_without_rows) {
  AddNamed(10, "a.exe");
  Pass();
  table.PrepareTable();
  EXPECT_EQ(list.Count(), 0);
}

TEST_F(TableColumns, The_captions_are_those_of_the_page) {
  table.PrepareTable();
  std::vector<Text> captions;
  for (const auto& column : list.Columns()) captions.push_back(column.caption);
  EXPECT_EQ(captions, (std::vector<Text>{u"יישום", u"שם תהליך", u"יוצר", u"פורטים", u"", u"", u"סה\"כ",
                                         u"שימוש כולל", u""}));
}

TEST_F(TableColumns, The_widths_are_told_in_twips_and_the_last_two_columns_hidden) {
  table.PrepareTable();
  std::vector<int> widths;
  for (const auto& column : list.Columns()) widths.push_back(column.width);
  EXPECT_EQ(widths, (std::vector<int>{3765, 3765, 2381, 2249, 1296, 1402, 1455, 2, 2}));
}

TEST_F(TableColumns, Ports_stand_at_the_right_and_both_rates_in_the_middle) {
  table.PrepareTable();
  EXPECT_EQ(Column(4).alignment, forms::Alignment::Trailing);
  EXPECT_EQ(Column(5).alignment, forms::Alignment::Centre);
  EXPECT_EQ(Column(6).alignment, forms::Alignment::Centre);
  for (const int other : {1, 2, 3, 7, 8, 9})
    EXPECT_EQ(Column(other).alignment, forms::Alignment::Leading) << other;
}

TEST_F(TableColumns, The_rates_have_header_icons_1_and_2_and_words_for_those_who_cannot_see_them) {
  table.PrepareTable();
  EXPECT_EQ(Column(5).icon, 1);
  EXPECT_EQ(Column(5).description, u"העלאה");
  EXPECT_EQ(Column(6).icon, 2);
  EXPECT_EQ(Column(6).description, u"הורדה");
}

TEST_F(TableColumns, Preparing_again_does_not_double_the_columns) {
  table.PrepareTable();
  table.PrepareTable();
  EXPECT_EQ(list.Columns().size(), 9u);
}

TEST_F(TableColumns, Preparing_clears_the_pinned_sort) {
  table.SortPinned = kTrue16;
  table.PrepareTable();
  EXPECT_EQ(table.SortPinned, kFalse16);
}

TEST_F(TableColumns, Coming_back_to_the_page_begins_all_totals_again) {
  AddNamed(10, "a.exe");
  Pass();
  Charge(10, 5, 5);
  table.PrepareTable();
  Pass();
  EXPECT_EQ(Row(10).CellTag(kUploadCell), Variant(0.0));
}

// Clicks on the headers.

TEST_F(TableColumns, A_click_sorts_by_that_column_ascending) {
  AddNamed(10, "b.exe");
  AddNamed(20, "a.exe");
  Pass();
  table.main_ListView1_ColumnClick(2);
  EXPECT_EQ(list.SortKey(), 1);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
  EXPECT_EQ(Order(), (std::vector<std::int64_t>{20, 10}));
}

TEST_F(TableColumns, A_second_click_turns_the_order_over_and_a_third_back) {
  AddNamed(10, "a.exe");
  AddNamed(20, "b.exe");
  Pass();
  table.main_ListView1_ColumnClick(2);
  table.main_ListView1_ColumnClick(2);
  EXPECT_EQ(list.Order(), forms::SortOrder::Descending);
  EXPECT_EQ(Order(), (std::vector<std::int64_t>{20, 10}));
  table.main_ListView1_ColumnClick(2);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
  EXPECT_EQ(Order(), (std::vector<std::int64_t>{10, 20}));
}

TEST_F(TableColumns, A_third_click_on_another_header_begins_ascending) {
  Pass();
  table.main_ListView1_ColumnClick(2);
  table.main_ListView1_ColumnClick(2);
  table.main_ListView1_ColumnClick(3);
  EXPECT_EQ(list.SortKey(), 2);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
}

TEST_F(TableColumns, A_second_click_on_another_header_keeps_ascending) {
  Pass();
  table.main_ListView1_ColumnClick(2);
  table.main_ListView1_ColumnClick(3);
  EXPECT_EQ(list.SortKey(), 2);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
}

TEST_F(TableColumns, A_click_on_the_download_header_after_a_pass_turns_the_passes_order_over) {
  Pass();
  table.main_ListView1_ColumnClick(6);
  EXPECT_EQ(list.SortKey(), 5);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
}

TEST_F(TableColumns, A_click_sets_the_sort_on) {
  ASSERT_FALSE(list.Sorted());
  table.main_ListView1_ColumnClick(1);
  EXPECT_TRUE(list.Sorted());
}

TEST_F(TableColumns, The_ports_are_ordered_as_text) {
  AddNamed(10, "a.exe");
  AddNamed(20, "b.exe");
  machine.AddConnection({2, "0.0.0.0", 9, "0.0.0.0", 0, 10});
  machine.AddConnection({2, "0.0.0.0", 1025, "0.0.0.0", 0, 20});
  Pass();
  table.main_ListView1_ColumnClick(4);
  EXPECT_EQ(Order(), (std::vector<std::int64_t>{20, 10}));
}

} // namespace quendra::monitor
