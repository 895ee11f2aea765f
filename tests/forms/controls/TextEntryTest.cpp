#include "forms/controls/Controls.h"
#include "forms/controls/RecordingViewFixture.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct TextEntryTest : testing::Test {
  TextEntryTest() {
    box.Attach(&view);
    view.told.clear();
    box.Change = [this] { ++changes; };
  }
  BareForm form;
  TextBox box{form, u"box"};
  ComboBox combo{form, u"combo"};
  RecordingView view;
  int changes = 0;
};

TEST_F(TextEntryTest, Another_text_tells_the_view_and_then_the_handler_with_the_caret_at_its_start) {
  box.Value = u"text";
  box.SelStart = 4;
  view.told.clear();
  box.Change = [&] { EXPECT_EQ(view.told, std::vector{Aspect::Entry}); };

  box.Value = u"longer text";

  EXPECT_EQ(box.Value(), u"longer text");
  EXPECT_EQ(box.SelStart(), 0);
}

TEST_F(TextEntryTest, The_same_text_tells_nobody_and_leaves_the_caret) {
  box.Value = u"text";
  box.SelStart = 2;
  view.told.clear();

  box.Value = u"text";

  EXPECT_EQ(changes, 1);
  EXPECT_EQ(box.SelStart(), 2);
  EXPECT_TRUE(view.told.empty());
}

TEST_F(TextEntryTest, Caret_and_selection_stay_within_the_text) {
  box.Value = u"text";
  box.SelStart = 99;
  EXPECT_EQ(box.SelStart(), 4);
  box.SelStart = -1;
  EXPECT_EQ(box.SelStart(), 0);
  box.SelStart = 1;
  box.SelLength = 99;
  EXPECT_EQ(box.SelLength(), 3);
  box.SelStart = 2;
  EXPECT_EQ(box.SelLength(), 0);
}

TEST_F(TextEntryTest, An_edit_of_the_user_is_told_to_the_handler_and_not_back_to_the_view) {
  box.Edited(u"a", 1);
  box.Edited(u"a", 1);

  EXPECT_EQ(changes, 1);
  EXPECT_EQ(box.SelStart(), 1);
  EXPECT_TRUE(view.told.empty());
}

TEST_F(TextEntryTest, A_chosen_item_stands_in_the_field_and_another_text_chooses_none) {
  combo.FreeText = true;
  combo.AddItem(u"one");
  int told = 0;
  combo.Change = [&] { ++told; };

  combo.SelectItem(0);
  EXPECT_EQ(combo.Value(), u"one");
  EXPECT_EQ(told, 0);
  combo.Value = u"other";

  EXPECT_EQ(told, 1);
  EXPECT_EQ(combo.ListIndex(), -1);
  EXPECT_EQ(combo.ListCount(), 1);
}

TEST_F(TextEntryTest, A_list_without_free_text_takes_none) {
  combo.AddItem(u"one");
  combo.SelectItem(0);

  combo.Value = u"other";

  EXPECT_EQ(combo.Value(), u"one");
  EXPECT_EQ(combo.ListIndex(), 0);
}

TEST_F(TextEntryTest, A_command_button_is_a_button_without_a_handler_too) {
  CommandButton button(form, u"button");

  EXPECT_TRUE(button.IsButton());
  EXPECT_TRUE(button.TakesFocus());
}

TEST_F(TextEntryTest, Cells_have_icons_and_keys) {
  ListView list(form, u"list");
  ListRow& row = list.Add(u"key", u"", 0);
  RecordingObserver observer;
  list.Observe(&observer);

  EXPECT_EQ(row.AddCell(u"text", Text(), 2, u"b0"), 1);
  EXPECT_EQ(row.CellIcon(1), 2);
  EXPECT_EQ(row.CellKey(1), u"b0");
  EXPECT_EQ(row.CellIcon(0), 0);
  row.SetCellIcon(1, 1);
  row.SetCellIcon(1, 1);

  EXPECT_EQ(row.CellIcon(1), 1);
  EXPECT_EQ(observer.told, (std::vector<std::string>{"changed 1.1", "changed 1.1"}));
}

} // namespace
} // namespace quendra::forms
