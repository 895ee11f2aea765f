#include "forms/controls/ListView.h"

#include "RecordingViewFixture.h"
#include "runtime/Fault.h"
#include "runtime/Format.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct ListViewTest : testing::Test {
  BareForm form;
  ListView list{form, u"main_ListView1"};
  RecordingView view;
  RecordingObserver observer;

  /// Adds a row with one cell beside the item.
  ListRow& Add(Text key, Text cell = {}) {
    ListRow& row = list.Add(key, u"item " + key, 1);
    row.AddCell(std::move(cell), {});
    return row;
  }
  void Watch() {
    list.Attach(&view);
    list.Observe(&observer);
    view.told.clear();
  }
  std::vector<Text> Keys() const {
    std::vector<Text> keys;
    for (int i = 1; i <= list.Count(); ++i) keys.push_back(list.Row(i).Key());
    return keys;
  }
  template <typename Work> static int FaultOf(Work work) {
    try {
      work();
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }
};

TEST_F(ListViewTest, Rows_are_numbered_from_1_in_the_order_of_adding) {
  Add(u"p4");
  Add(u"p8");

  EXPECT_EQ(list.Row(1).Key(), u"p4");
  EXPECT_EQ(list.Row(2).Key(), u"p8");
  EXPECT_EQ(list.IndexOf(list.Row(2)), 2);
}

TEST_F(ListViewTest, A_row_outside_the_list_is_no_element) {
  Add(u"p4");

  EXPECT_EQ(FaultOf([&] { list.Row(0); }), Fault::kNoSuchElement);
  EXPECT_EQ(FaultOf([&] { list.Row(2); }), Fault::kNoSuchElement);
  EXPECT_EQ(FaultOf([&] { list.Remove(2); }), Fault::kNoSuchElement);
}

TEST_F(ListViewTest, A_key_in_use_is_a_fault_and_adds_nothing) {
  Add(u"p4");
  Watch();

  EXPECT_EQ(FaultOf([&] { list.Add(u"p4", u"again", 1); }), Fault::kDuplicateKey);

  EXPECT_EQ(list.Count(), 1);
  EXPECT_TRUE(observer.told.empty());
}

TEST_F(ListViewTest, Rows_without_a_key_are_as_many_as_one_likes_and_none_is_found) {
  list.Add({}, u"a", 0);
  list.Add({}, u"b", 0);
  list.Remove(1);

  EXPECT_EQ(list.Count(), 1);
  EXPECT_EQ(list.Find({}), nullptr);
}

TEST_F(ListViewTest, A_key_is_free_again_once_its_row_was_removed_or_the_list_cleared) {
  Add(u"p4");
  list.Remove(1);
  EXPECT_EQ(list.Find(u"p4"), nullptr);

  Add(u"p4");
  list.Clear();
  Add(u"p4");

  EXPECT_EQ(list.Find(u"p4"), &list.Row(1));
}

TEST_F(ListViewTest, A_row_is_found_by_its_key_wherever_sorting_put_it) {
  Add(u"p4", u"a");
  Add(u"p8", u"b");

  list.Sort(1, SortOrder::Descending);

  EXPECT_EQ(list.IndexOf(*list.Find(u"p4")), 2);
  EXPECT_EQ(list.Find(u"p9"), nullptr);
}

TEST_F(ListViewTest, A_cell_that_the_row_lacks_is_out_of_range) {
  ListRow& row = Add(u"p4", u"a");

  EXPECT_EQ(FaultOf([&] { (void)row.CellText(2); }), Fault::kSubscript);
  EXPECT_EQ(FaultOf([&] { (void)row.CellTag(-1); }), Fault::kSubscript);
  EXPECT_EQ(FaultOf([&] { row.SetCellText(2, u"x"); }), Fault::kSubscript);
}

TEST_F(ListViewTest, Cell_0_is_the_item_itself) {
  ListRow& row = Add(u"p4", u"a");

  row.SetCellText(0, u"renamed");
  row.CellTag(0) = u"1";

  EXPECT_EQ(row.CellText(0), u"renamed");
  EXPECT_EQ(row.CellTag(0).AsText(), u"1");
  EXPECT_EQ(row.CellCount(), 1);
}

TEST_F(ListViewTest, The_first_row_becomes_the_selection_and_later_rows_do_not) {
  ListRow& first = Add(u"p4");
  Add(u"p8");

  EXPECT_EQ(list.SelectedItem(), &first);
}

TEST_F(ListViewTest, The_selection_follows_its_row_through_sorting) {
  ListRow& first = Add(u"p4", u"a");
  Add(u"p8", u"b");
  Watch();

  list.Sort(1, SortOrder::Descending);

  EXPECT_EQ(list.SelectedItem(), &first);
  EXPECT_EQ(list.IndexOf(first), 2);
  EXPECT_EQ(observer.told, std::vector<std::string>{"moved"});
}

TEST_F(ListViewTest, The_selection_follows_its_row_when_one_above_goes) {
  Add(u"p4");
  ListRow& second = Add(u"p8");
  list.Select(&second);

  list.Remove(1);

  EXPECT_EQ(list.SelectedItem(), &second);
  EXPECT_EQ(list.IndexOf(second), 1);
}

TEST_F(ListViewTest, A_removed_selection_passes_to_the_row_in_its_place) {
  Add(u"p4");
  list.Select(&Add(u"p8"));
  ListRow& third = Add(u"p12");

  list.Remove(2);

  EXPECT_EQ(list.SelectedItem(), &third);
}

TEST_F(ListViewTest, A_removed_selection_at_the_end_passes_to_the_last_row) {
  ListRow& first = Add(u"p4");
  list.Select(&Add(u"p8"));

  list.Remove(2);
  EXPECT_EQ(list.SelectedItem(), &first);

  list.Remove(1);
  EXPECT_EQ(list.SelectedItem(), nullptr);
}

TEST_F(ListViewTest, Clearing_takes_the_selection_too) {
  Add(u"p4");
  Watch();

  list.Clear();
  list.Clear();

  EXPECT_EQ(list.SelectedItem(), nullptr);
  EXPECT_EQ(list.Count(), 0);
  EXPECT_EQ(observer.told, std::vector<std::string>{"cleared"});
}

TEST_F(ListViewTest, Sorting_goes_by_text_and_not_by_number) {
  Add(u"p1", u"9.00");
  Add(u"p2", u"10.00");
  Add(u"p3", u"100.00");

  list.Sort(1, SortOrder::Ascending);

  EXPECT_EQ(Keys(), (std::vector<Text>{u"p2", u"p3", u"p1"}));
}

TEST_F(ListViewTest, An_empty_cell_stands_last_in_descending_order) {
  Add(u"p1", u"");
  Add(u"p2", u"003.50");
  Add(u"p3", u"120.00");

  list.Sort(1, SortOrder::Descending);

  EXPECT_EQ(Keys(), (std::vector<Text>{u"p3", u"p2", u"p1"}));
}

TEST_F(ListViewTest, Equal_rows_keep_their_order_in_both_directions) {
  Add(u"p1", u"x");
  Add(u"p2", u"y");
  Add(u"p3", u"x");
  Add(u"p4", u"y");

  list.Sort(1, SortOrder::Descending);
  EXPECT_EQ(Keys(), (std::vector<Text>{u"p2", u"p4", u"p1", u"p3"}));

  list.Sort(1, SortOrder::Ascending);
  EXPECT_EQ(Keys(), (std::vector<Text>{u"p1", u"p3", u"p2", u"p4"}));
}

TEST_F(ListViewTest, Equal_rows_keep_their_order_in_long_lists_too) {
  for (int i = 0; i < 300; ++i) Add(u"p" + DecimalText(i), i % 3 == 0 ? u"b" : u"a");

  list.Sort(1, SortOrder::Descending);

  for (int i = 1; i <= 100; ++i) EXPECT_EQ(list.Row(i).Key(), u"p" + DecimalText((i - 1) * 3));
  for (int i = 101; i < 300; ++i)
    EXPECT_LT(NumberOf(list.Row(i).Key().substr(1)), NumberOf(list.Row(i + 1).Key().substr(1)));
}

TEST_F(ListViewTest, Latin_letters_sort_without_regard_to_case) {
  Add(u"p1", u"b");
  Add(u"p2", u"A");
  Add(u"p3", u"a");

  list.Sort(1, SortOrder::Ascending);

  EXPECT_EQ(Keys(), (std::vector<Text>{u"p2", u"p3", u"p1"}));
}

TEST_F(ListViewTest, A_row_without_the_sorted_cell_counts_as_empty) {
  list.Add(u"p1", u"short", 1);
  Add(u"p2", u"x");

  list.Sort(1, SortOrder::Descending);

  EXPECT_EQ(Keys(), (std::vector<Text>{u"p2", u"p1"}));
}

TEST_F(ListViewTest, Sorting_is_remembered) {
  EXPECT_FALSE(list.Sorted());

  list.Sort(5, SortOrder::Descending);

  EXPECT_TRUE(list.Sorted());
  EXPECT_EQ(list.SortKey(), 5);
  EXPECT_EQ(list.Order(), SortOrder::Descending);
}

TEST_F(ListViewTest, Sorting_rows_that_stand_right_already_tells_nobody) {
  Add(u"p1", u"a");
  Add(u"p2", u"b");
  Watch();
  const auto revision = list.Revision();

  list.Sort(1, SortOrder::Ascending);

  EXPECT_TRUE(observer.told.empty());
  EXPECT_EQ(list.Revision(), revision);
}

TEST_F(ListViewTest, A_view_hears_of_each_row_and_cell_that_changes) {
  Watch();

  ListRow& row = list.Add(u"p4", u"item", 1);
  row.AddCell(u"0", 0);
  row.SetCellText(1, u"003.50");
  row.SetCellColour(1, kRed);
  row.SetCellBold(0, true);
  list.Remove(1);

  EXPECT_EQ(observer.told, (std::vector<std::string>{"added 1", "changed 1.1", "changed 1.1", "changed 1.1",
                                                     "changed 1.0", "removed 1"}));
}

TEST_F(ListViewTest, A_cell_that_is_set_to_what_it_holds_tells_nobody) {
  ListRow& row = Add(u"p4", u"a");
  Watch();
  const auto revision = list.Revision();

  row.SetCellText(1, u"a");
  row.SetCellColour(1, kBlack);
  row.SetCellBold(1, false);

  EXPECT_TRUE(observer.told.empty());
  EXPECT_EQ(list.Revision(), revision);
}

TEST_F(ListViewTest, A_text_put_behind_a_cells_text_is_told_as_a_change_and_an_empty_one_is_not) {
  ListRow& row = Add(u"p4", u".80.");
  Watch();

  row.AppendCellText(1, u"443.");
  row.AppendCellText(1, u"");

  EXPECT_EQ(row.CellText(1), u".80.443.");
  EXPECT_EQ(observer.told, (std::vector<std::string>{"changed 1.1"}));
  EXPECT_EQ(FaultOf([&] { row.AppendCellText(2, u"x"); }), Fault::kSubscript);
}

TEST_F(ListViewTest, The_revision_grows_with_rows_order_and_texts_and_not_with_tags) {
  ListRow& row = Add(u"p4", u"a");
  Add(u"p8", u"b");
  const auto stood = [&](auto change) {
    const auto before = list.Revision();
    change();
    return list.Revision() == before;
  };

  EXPECT_TRUE(stood([&] { row.CellTag(1) = 5.0; }));
  EXPECT_FALSE(stood([&] { row.SetCellText(1, u"x"); }));
  EXPECT_FALSE(stood([&] { list.Sort(1, SortOrder::Ascending); }));
  EXPECT_FALSE(stood([&] { Add(u"p12"); }));
  EXPECT_FALSE(stood([&] { list.Remove(1); }));
  EXPECT_FALSE(stood([&] { list.Clear(); }));
}

TEST_F(ListViewTest, Selecting_tells_the_view_once) {
  Add(u"p4");
  ListRow& second = Add(u"p8");
  Watch();

  list.Select(&second);
  list.Select(&second);

  EXPECT_EQ(view.told, std::vector{Aspect::Selection});
}

TEST_F(ListViewTest, Columns_are_told_when_they_are_cleared_and_added) {
  Watch();

  list.ClearColumns();
  list.AddColumn({u"name", 3765});

  EXPECT_EQ(list.Columns().size(), 1U);
  EXPECT_EQ(observer.told, (std::vector<std::string>{"columns", "columns"}));
}

TEST_F(ListViewTest, References_to_a_row_hold_while_other_rows_come_and_go) {
  ListRow& first = Add(u"p0", u"kept");
  for (int i = 1; i <= 100; ++i) Add(u"p" + DecimalText(i));
  while (list.Count() > 50) list.Remove(2);

  EXPECT_EQ(first.CellText(1), u"kept");
  EXPECT_EQ(list.Find(u"p0"), &first);
}

} // namespace
} // namespace quendra::forms
