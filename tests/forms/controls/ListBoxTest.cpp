#include "forms/controls/ListBox.h"

#include "RecordingViewFixture.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct ListBoxTest : testing::Test {
  BareForm form;
  ListBox list{form, u"lstNICs"};
  int clicks = 0;
  RecordingView view;

  ListBoxTest() {
    list.AddItem(u"first");
    list.AddItem(u"second");
    list.Click = [this] { ++clicks; };
  }
};

TEST_F(ListBoxTest, Items_are_numbered_from_0_and_none_is_selected_at_first) {
  EXPECT_EQ(list.ListCount(), 2);
  EXPECT_EQ(list.List(0), u"first");
  EXPECT_EQ(list.List(1), u"second");
  EXPECT_EQ(list.ListIndex(), -1);
}

TEST_F(ListBoxTest, Selecting_raises_a_click_each_time_and_tells_the_view_of_another_item_alone) {
  list.Attach(&view);
  view.told.clear();

  list.SelectItem(1);
  list.SelectItem(1);

  EXPECT_EQ(list.ListIndex(), 1);
  EXPECT_EQ(clicks, 2);
  EXPECT_EQ(view.told, std::vector{Aspect::Selection});
}

TEST_F(ListBoxTest, An_index_that_the_list_lacks_selects_nothing_and_raises_nothing) {
  for (const int index : {2, -1}) {
    list.SelectItem(0);
    clicks = 0;

    list.SelectItem(index);

    EXPECT_EQ(list.ListIndex(), -1) << index;
    EXPECT_EQ(clicks, 0) << index;
  }
}

TEST_F(ListBoxTest, Clearing_takes_items_and_selection_and_tells_once) {
  list.SelectItem(0);
  list.Attach(&view);
  view.told.clear();

  list.Clear();
  list.Clear();

  EXPECT_EQ(list.ListCount(), 0);
  EXPECT_EQ(list.ListIndex(), -1);
  EXPECT_EQ(view.told, std::vector{Aspect::Items});
}

TEST_F(ListBoxTest, A_selection_by_the_mouse_is_kept_and_told_to_nobody) {
  list.Attach(&view);
  view.told.clear();

  list.Selected(1);
  list.Selected(2);

  EXPECT_EQ(list.ListIndex(), 1);
  EXPECT_EQ(clicks, 0);
  EXPECT_TRUE(view.told.empty());
}

TEST_F(ListBoxTest, An_item_outside_the_list_is_out_of_range) {
  for (const int index : {-1, 2}) {
    try {
      (void)list.List(index);
      FAIL() << "item " << index << " was there";
    } catch (const Fault& fault) {
      EXPECT_EQ(fault.number, Fault::kSubscript);
    }
  }
}

} // namespace
} // namespace quendra::forms
