#include "forms/qt/QtFixture.h"

#include <QListWidget>

namespace quendra::forms::qt {

class ListBoxOnScreen : public QtFixture {
 protected:
  ListBoxOnScreen() {
    form.design = [this] { list.Move(0, 0, 6000, 3000); };
    list.AddItem(u"אטום");
    list.AddItem(u"eth0 (10.0.0.5)");
    list.Click = [this] { chosen.push_back(list.ListIndex()); };
  }
  QListWidget& View() { return As<QListWidget>(list); }
  QPoint PlaceOf(int item) { return View().visualItemRect(View().item(item)).center(); }
  void ClickItem(int item, Qt::KeyboardModifiers modifiers = {}) {
    PressMouse(*View().viewport(), PlaceOf(item), Qt::LeftButton, modifiers);
    ReleaseMouse(*View().viewport(), PlaceOf(item), Qt::LeftButton, modifiers);
  }
  /// The rows that are drawn as chosen.
  std::vector<int> ShownAsChosen() {
    std::vector<int> rows;
    for (int row = 0; row < View().count(); ++row)
      if (View().item(row)->isSelected()) rows.push_back(row);
    return rows;
  }

  ListBox list{form, u"lstNICs"};
  std::vector<int> chosen;
};

TEST_F(ListBoxOnScreen, Shows_its_items_and_sets_Latin_ones_apart_from_the_reading_direction) {
  desktop.Show(form);

  ASSERT_EQ(View().count(), 2);
  EXPECT_EQ(View().item(0)->text(), QStringLiteral("אטום"));
  EXPECT_EQ(View().item(1)->text(), QStringLiteral(u"\u2066eth0 (10.0.0.5)\u2069"));
  EXPECT_EQ(View().currentRow(), -1);
}

TEST_F(ListBoxOnScreen, A_click_of_the_mouse_chooses_once_and_again_on_what_is_chosen) {
  ShowActive();

  ClickItem(1);
  ClickItem(1);

  EXPECT_EQ(chosen, (std::vector<int>{1, 1}));
  EXPECT_EQ(View().currentRow(), 1);
}

TEST_F(ListBoxOnScreen, Ctrl_and_a_click_leave_what_is_shown_and_what_is_chosen_the_same) {
  ShowActive();

  for (const int item : {1, 1, 0, 0}) {
    ClickItem(item, Qt::ControlModifier);

    EXPECT_EQ(list.ListIndex(), item);
    EXPECT_EQ(ShownAsChosen(), std::vector<int>{item});
  }
}

TEST_F(ListBoxOnScreen, A_double_click_is_told_as_one) {
  int doubled = 0;
  list.DoubleClick = [&] { ++doubled; };
  ShowActive();

  ClickItem(0);
  DoubleClickMouse(*View().viewport(), PlaceOf(0));

  EXPECT_EQ(doubled, 1);
  EXPECT_EQ(chosen, std::vector<int>{0});
}

TEST_F(ListBoxOnScreen, A_choice_by_the_program_is_shown_and_raises_one_click) {
  ShowActive();

  list.SelectItem(1);

  EXPECT_EQ(View().currentRow(), 1);
  EXPECT_EQ(chosen, std::vector<int>{1});
}

TEST_F(ListBoxOnScreen, An_item_with_harmful_characters_shows_them_as_signs) {
  list.AddItem(u"a\u202Eb\n<b>");

  desktop.Show(form);

  EXPECT_EQ(View().item(2)->data(Qt::AccessibleTextRole).toString(), QStringLiteral(u"a\uFFFDb\u240A<b>"));
  EXPECT_EQ(View().item(2)->toolTip(), QStringLiteral(u"a\uFFFDb\u240A&lt;b&gt;"));
}

TEST_F(ListBoxOnScreen, Emptying_and_filling_reach_the_view) {
  ShowActive();
  list.SelectItem(1);

  list.Clear();
  EXPECT_EQ(View().count(), 0);
  list.AddItem(u"wlan0");

  EXPECT_EQ(View().count(), 1);
  EXPECT_EQ(View().currentRow(), -1);
}

TEST_F(ListBoxOnScreen, A_key_that_the_toolkit_moves_by_chooses_with_a_click_too) {
  list.AddItem(u"wlan0");
  ShowActive();
  list.SelectItem(0);

  PressKey(View(), Qt::Key_PageDown);

  EXPECT_EQ(chosen, (std::vector<int>{0, 2}));
}

} // namespace quendra::forms::qt
