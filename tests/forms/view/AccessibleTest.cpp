#include "forms/view/Accessible.h"

#include "forms/controls/Controls.h"
#include "forms/view/BareForm.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct AccessibleTest : testing::Test {
  BareForm form;
  Frame frame{form, u"main_frameAdapters"};
  Label label{form, u"main_Label2"};
  ComboBox combo{frame, u"main_cmbAdapters"};
};

TEST_F(AccessibleTest, The_name_is_the_caption_and_the_description_the_controls_name) {
  form.Caption = Text(u"חלון");
  label.Caption = Text(u"העלאה:");
  frame.Caption = Text(u" עקוב אחרי התקן ");

  EXPECT_EQ(AccessibleOf(form).name, u"חלון");
  EXPECT_EQ(AccessibleOf(form).description, u"frmBare");
  EXPECT_EQ(AccessibleOf(label).name, u"העלאה:");
  EXPECT_EQ(AccessibleOf(label).description, u"main_Label2");
  EXPECT_EQ(AccessibleOf(frame).name, u"עקוב אחרי התקן");
  EXPECT_EQ(AccessibleOf(frame).description, u"main_frameAdapters");
}

TEST_F(AccessibleTest, A_name_keeps_its_lines_and_shows_what_would_harm) {
  label.Caption = Text(u"one\ntwo\u202E");

  EXPECT_EQ(AccessibleOf(label).name, u"one\ntwo\uFFFD");
}

TEST_F(AccessibleTest, A_label_without_a_caption_is_named_by_what_it_says_of_itself) {
  label.Description = u"מוניטור";

  EXPECT_EQ(AccessibleOf(label).name, u"מוניטור");
}

TEST_F(AccessibleTest, A_combo_box_is_named_by_the_frame_around_it) {
  frame.Caption = Text(u"התקן");
  ComboBox alone(form, u"alone");

  EXPECT_EQ(AccessibleOf(combo).name, u"התקן");
  EXPECT_EQ(AccessibleOf(alone).name, u"");
}

TEST_F(AccessibleTest, A_field_is_named_by_its_description_else_the_label_before_it_else_its_frame) {
  frame.Caption = Text(u"מסגרת");
  TextBox first(frame, u"first");
  Label before(frame, u"before");
  TextBox second(frame, u"second");
  before.Caption = Text(u"כתובת:");
  combo.FreeText = true;

  EXPECT_EQ(AccessibleOf(first).name, u"מסגרת");
  EXPECT_EQ(AccessibleOf(combo).name, u"מסגרת");
  EXPECT_EQ(AccessibleOf(second).name, u"כתובת:");
  second.Description = u"דוח";
  EXPECT_EQ(AccessibleOf(second).name, u"דוח");
  before.Click = [] {};
  second.Description = {};
  EXPECT_EQ(AccessibleOf(second).name, u"מסגרת");
}

TEST_F(AccessibleTest, A_list_is_named_by_its_description) {
  ListView list(form, u"list");
  list.Description = u"תהליכים\u202E";

  EXPECT_EQ(AccessibleOf(list).name, u"תהליכים\uFFFD");
}

TEST_F(AccessibleTest, A_list_box_is_named_as_fields_are) {
  label.Caption = Text(u"כרטיסי רשת:");
  ListBox list(form, u"lstNICs");
  EXPECT_EQ(AccessibleOf(list).name, u"כרטיסי רשת:");

  list.Description = u"רשימה";

  EXPECT_EQ(AccessibleOf(list).name, u"רשימה");
  EXPECT_EQ(AccessibleOf(list).role, Role::Toolkits);
}

TEST_F(AccessibleTest, A_command_button_is_a_button) {
  CommandButton button(form, u"button");
  button.Caption = Text(u"התחל");

  EXPECT_EQ(AccessibleOf(button).role, Role::Button);
  EXPECT_EQ(AccessibleOf(button).name, u"התחל");
}

TEST_F(AccessibleTest, Every_kind_has_its_role) {
  PictureBox box(form, u"box");
  Image image(form, u"image");
  Line line(form, u"line");
  ListView list(form, u"list");

  EXPECT_EQ(AccessibleOf(form).role, Role::Window);
  EXPECT_EQ(AccessibleOf(frame).role, Role::Grouping);
  EXPECT_EQ(AccessibleOf(box).role, Role::Graphic);
  EXPECT_EQ(AccessibleOf(image).role, Role::Graphic);
  EXPECT_EQ(AccessibleOf(line).role, Role::Separator);
  EXPECT_EQ(AccessibleOf(label).role, Role::Text);
  EXPECT_EQ(AccessibleOf(combo).role, Role::Toolkits);
  EXPECT_EQ(AccessibleOf(list).role, Role::Toolkits);
}

TEST_F(AccessibleTest, A_picture_that_can_be_clicked_is_a_button_named_by_its_window) {
  PictureBox box(form, u"box");
  Image image(form, u"image");
  form.Caption = Text(u"אודות");
  EXPECT_EQ(AccessibleOf(image).name, u"");

  box.Click = image.Click = [] {};

  EXPECT_EQ(AccessibleOf(box).role, Role::Button);
  EXPECT_EQ(AccessibleOf(image).role, Role::Button);
  EXPECT_EQ(AccessibleOf(image).name, u"אודות");
  EXPECT_TRUE(OffersPress(image));
}

TEST_F(AccessibleTest, A_label_becomes_a_button_with_its_handler_for_clicks_and_no_other) {
  label.DoubleClick = [] {};
  EXPECT_EQ(AccessibleOf(label).role, Role::Text);
  EXPECT_FALSE(OffersPress(label));

  label.Click = [] {};

  EXPECT_EQ(AccessibleOf(label).role, Role::Button);
  EXPECT_TRUE(OffersPress(label));
}

TEST_F(AccessibleTest, A_button_that_is_disabled_or_stands_in_a_disabled_container_offers_no_press) {
  Label inner(frame, u"inner");
  inner.Click = [] {};
  label.Click = [] {};

  label.Enabled = false;
  frame.Enabled = false;

  EXPECT_FALSE(OffersPress(label));
  EXPECT_FALSE(OffersPress(inner));
}

TEST_F(AccessibleTest, A_column_with_an_icon_in_place_of_a_caption_is_named_by_its_description) {
  EXPECT_EQ(AccessibleNameOf(ColumnHeader{u"שם", 100, Alignment::Leading, 0, u"other"}), u"שם");
  EXPECT_EQ(AccessibleNameOf(ColumnHeader{u"", 100, Alignment::Leading, 1, u"קצב העלאה"}), u"קצב העלאה");
}

} // namespace
} // namespace quendra::forms
