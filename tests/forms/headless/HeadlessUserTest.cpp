#include "forms/headless/HeadlessDesktopFixture.h"

// What a test does in the place of the user.

namespace quendra::forms::headless {
namespace {

TEST_F(HeadlessDesktopTest, Only_a_control_that_is_shown_and_enabled_can_be_clicked) {
  int clicks = 0;
  form.label.Click = [&] { ++clicks; };

  form.page.Visible = false;
  EXPECT_FALSE(desktop.Click(form.label));
  form.page.Visible = true;
  form.page.Enabled = false;
  EXPECT_FALSE(desktop.Click(form.label));
  form.page.Enabled = true;
  form.label.Enabled = false;
  EXPECT_FALSE(desktop.Click(form.label));
  form.label.Enabled = true;
  EXPECT_TRUE(desktop.Click(form.label));

  EXPECT_EQ(clicks, 1);
}

TEST_F(HeadlessDesktopTest, The_mouse_reaches_a_control_with_button_keys_and_place) {
  std::vector<int> got;
  form.picture.MouseMove = [&](int button, int shift, int x, int y) { got = {button, shift, x, y}; };

  EXPECT_TRUE(desktop.MouseMove(form.picture, kLeftButton, kCtrl, 30, 45));

  EXPECT_EQ(got, (std::vector<int>{1, 2, 30, 45}));
}

TEST_F(HeadlessDesktopTest, Keys_reach_a_form_that_previews_them) {
  EXPECT_FALSE(desktop.KeyDown(form, 'I', kCtrl));
  form.KeyPreview = true;
  EXPECT_TRUE(desktop.KeyDown(form, 'I', kCtrl));

  EXPECT_EQ(form.keys, std::vector<int>{'I' * 10 + 2});
}

TEST_F(HeadlessDesktopTest, Choosing_an_item_clicks_the_list_and_an_item_that_is_not_there_cannot_be_chosen) {
  int clicks = 0;
  form.combo.AddItem(u"only");
  form.combo.Click = [&] { ++clicks; };

  EXPECT_TRUE(desktop.ChooseItem(form.combo, 0));
  EXPECT_FALSE(desktop.ChooseItem(form.combo, 1));

  EXPECT_EQ(form.combo.ListIndex(), 0);
  EXPECT_EQ(clicks, 1);
}

TEST_F(HeadlessDesktopTest, Headers_and_rows_of_a_list_are_clicked_by_number_from_1) {
  std::vector<int> headers;
  form.list.AddColumn({u"name", 100});
  form.list.ColumnClick = [&](int header) { headers.push_back(header); };
  form.list.Add(u"p4", u"a", 1);
  ListRow& second = form.list.Add(u"p8", u"b", 1);

  EXPECT_TRUE(desktop.ClickHeader(form.list, 1));
  EXPECT_FALSE(desktop.ClickHeader(form.list, 2));
  EXPECT_TRUE(desktop.ClickRow(form.list, 2));
  EXPECT_FALSE(desktop.ClickRow(form.list, 3));

  EXPECT_EQ(headers, std::vector<int>{1});
  EXPECT_EQ(form.list.SelectedItem(), &second);
}

TEST_F(HeadlessDesktopTest, Typing_puts_the_focus_there_and_passes_the_handler) {
  TextBox box(form, u"box");
  desktop.Show(form);
  box.KeyPress = [](int& keyCode) { keyCode = keyCode == '!' ? 0 : keyCode; };

  EXPECT_TRUE(desktop.Type(box, u"a!bc\b"));

  EXPECT_EQ(box.Value(), u"ab");
  EXPECT_EQ(desktop.Focused(form), &box);
  EXPECT_FALSE(desktop.Type(form.label, u"a"));
  box.Enabled = false;
  EXPECT_FALSE(desktop.Type(box, u"a"));
}

TEST_F(HeadlessDesktopTest, A_backspace_takes_a_whole_line_break) {
  TextBox box(form, u"box");
  box.MultiLine = true;
  desktop.Show(form);

  desktop.Type(box, u"a\rb");
  EXPECT_EQ(box.Value(), u"a\r\nb");
  desktop.Type(box, u"\b\b");

  EXPECT_EQ(box.Value(), u"a");
}

} // namespace
} // namespace quendra::forms::headless
