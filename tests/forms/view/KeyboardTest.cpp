#include "forms/view/Keyboard.h"

#include "forms/headless/HeadlessDesktop.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct DialogForm : Form {
  DialogForm() : Form(u"frmDialog") {}
  void Design() override {}
  void Form_KeyDown(int keyCode, int /*shift*/) override {
    pressed.push_back(u"key " + DecimalText(keyCode));
    if (onKey) onKey();
  }

  Frame page{*this, u"page"};
  Label ok{page, u"ok"};
  PictureBox picture{*this, u"picture"};
  Label close{picture, u"close"};
  std::vector<Text> pressed;
  std::function<void()> onKey;
};

struct FormKeys : testing::Test {
  FormKeys() {
    form.ok.Click = [this] { form.pressed.push_back(u"ok"); };
    form.close.Click = [this] { form.pressed.push_back(u"close"); };
    form.Default = &form.ok;
    form.Cancel = &form.close;
    desktop.Show(form);
  }

  headless::HeadlessDesktop desktop;
  DialogForm form;
};

using Pressed = std::vector<Text>;

TEST_F(FormKeys, Escape_clicks_the_cancel_control_and_Enter_the_default_one) {
  EXPECT_TRUE(desktop.KeyDown(form, kEscapeKey));
  EXPECT_TRUE(desktop.KeyDown(form, kEnterKey));

  EXPECT_EQ(form.pressed, (Pressed{u"close", u"ok"}));
}

TEST_F(FormKeys, Any_other_key_clicks_nothing) {
  for (const int key : {0, 9, 32, 65}) EXPECT_FALSE(desktop.KeyDown(form, key)) << key;

  EXPECT_TRUE(form.pressed.empty());
}

TEST_F(FormKeys, Escape_with_a_modifier_belongs_to_the_system) {
  for (const int shift : {kShift, kCtrl, kAlt})
    EXPECT_FALSE(desktop.KeyDown(form, kEscapeKey, shift)) << shift;
}

TEST_F(FormKeys, A_form_without_these_controls_takes_neither_key) {
  form.Default = form.Cancel = nullptr;

  EXPECT_FALSE(desktop.KeyDown(form, kEscapeKey));
  EXPECT_FALSE(desktop.KeyDown(form, kEnterKey));
}

TEST_F(FormKeys, A_disabled_control_is_not_clicked) {
  form.close.Enabled = false;

  EXPECT_FALSE(desktop.KeyDown(form, kEscapeKey));
}

TEST_F(FormKeys, A_control_in_a_hidden_or_disabled_container_is_not_clicked) {
  form.picture.Visible = false;
  form.page.Enabled = false;

  EXPECT_FALSE(desktop.KeyDown(form, kEscapeKey));
  EXPECT_FALSE(desktop.KeyDown(form, kEnterKey));
}

TEST_F(FormKeys, A_form_with_a_preview_hears_of_the_key_first) {
  form.KeyPreview = true;

  desktop.KeyDown(form, kEscapeKey);

  EXPECT_EQ(form.pressed, (Pressed{u"key 27", u"close"}));
}

TEST_F(FormKeys, A_preview_that_unloads_the_form_leaves_nothing_to_click) {
  DialogForm other;
  desktop.Show(other);
  form.KeyPreview = true;
  form.onKey = [this] { desktop.Unload(form); };

  desktop.KeyDown(form, kEscapeKey);

  EXPECT_EQ(form.pressed, Pressed{u"key 27"});
}

TEST_F(FormKeys, The_tab_order_goes_by_the_index_and_then_as_controls_stand_in_their_containers) {
  form.page.TabIndex = 1;

  EXPECT_EQ(TabOrder(form), (std::vector<Control*>{&form.ok, &form.picture, &form.close, &form.page}));
}

TEST_F(FormKeys, The_first_focus_goes_to_the_first_control_that_is_there_to_take_it) {
  EXPECT_EQ(FirstFocus(form), &form.ok);
  form.ok.Enabled = false;
  EXPECT_EQ(FirstFocus(form), &form.close);
  form.picture.Visible = false;
  EXPECT_EQ(FirstFocus(form), nullptr);
}

TEST_F(FormKeys, The_first_focus_goes_to_lists_too) {
  ListView list(form, u"list");
  ComboBox combo(form, u"combo");
  list.TabIndex = combo.TabIndex = -1;

  EXPECT_EQ(FirstFocus(form), &list);
  list.Visible = false;
  EXPECT_EQ(FirstFocus(form), &combo);
}

TEST_F(FormKeys, Keys_go_to_items_of_a_list_box_and_stop_at_its_ends) {
  ListBox list(form, u"list");
  EXPECT_FALSE(ItemReachedBy(list, {kDownKey}));
  for (const char16_t* item : {u"one", u"two", u"three"}) list.AddItem(item);
  EXPECT_EQ(ItemReachedBy(list, {kDownKey}), 0);
  EXPECT_EQ(ItemReachedBy(list, {kUpKey}), 0);
  EXPECT_EQ(ItemReachedBy(list, {kEndKey}), 2);

  list.SelectItem(2);

  EXPECT_EQ(ItemReachedBy(list, {kDownKey}), 2);
  EXPECT_EQ(ItemReachedBy(list, {kUpKey}), 1);
  EXPECT_EQ(ItemReachedBy(list, {kHomeKey}), 0);
  EXPECT_FALSE(ItemReachedBy(list, {kHomeKey, kShift}));
  EXPECT_FALSE(ItemReachedBy(list, {'A'}));
}

TEST(KeyCodes, Are_those_of_characters_with_Latin_letters_as_upper_case) {
  EXPECT_EQ(CodeOfCharacter(u'a'), 'A');
  EXPECT_EQ(CodeOfCharacter(u'z'), 'Z');
  EXPECT_EQ(CodeOfCharacter(u'A'), 'A');
  EXPECT_EQ(CodeOfCharacter(u'5'), '5');
  EXPECT_EQ(CodeOfCharacter(u'ן'), 0x05DF);
}

TEST(KeyCodes, Come_with_the_sum_of_the_keys_that_modify_them) {
  EXPECT_EQ(ShiftSum(false, false, false), 0);
  EXPECT_EQ(ShiftSum(true, false, false), 1);
  EXPECT_EQ(ShiftSum(false, true, false), 2);
  EXPECT_EQ(ShiftSum(false, false, true), 4);
  EXPECT_EQ(ShiftSum(true, true, true), 7);
}

TEST_F(FormKeys, A_form_without_a_preview_hears_of_the_keys_that_come_to_no_control) {
  EXPECT_FALSE(HearsOf(form, {'A'}, true));
  EXPECT_TRUE(HearsOf(form, {'A'}, false));
  form.KeyPreview = true;
  EXPECT_TRUE(HearsOf(form, {'A'}, true));
}

TEST_F(FormKeys, A_key_without_a_code_is_heard_of_by_nobody) {
  form.KeyPreview = true;

  EXPECT_FALSE(HearsOf(form, {0}, false));
}

TEST_F(FormKeys, A_key_held_down_clicks_no_further_control) {
  EXPECT_EQ(ControlPressedBy(form, {kEscapeKey, kNoShift, false}), &form.close);
  EXPECT_EQ(ControlPressedBy(form, {kEscapeKey, kNoShift, true}), nullptr);
}

TEST_F(FormKeys, Enter_and_Space_press_a_label_that_is_a_button_once) {
  for (const int key : {kEnterKey, kSpaceKey}) {
    EXPECT_TRUE(PressesLabel(form.ok, {key}));
    EXPECT_FALSE(PressesLabel(form.ok, {key, kNoShift, true}));
    EXPECT_FALSE(PressesLabel(form.ok, {key, kAlt}));
    EXPECT_TRUE(PressesLabel(form.ok, {key, kCtrl}));
  }
  EXPECT_FALSE(PressesLabel(form.ok, {'A'}));
  Label text(form, u"text");
  EXPECT_FALSE(PressesLabel(text, {kEnterKey}));
}

TEST(ListKeys, With_Ctrl_or_Alt_and_a_character_belong_to_the_form) {
  EXPECT_TRUE(PassesList(kCtrl, true));
  EXPECT_TRUE(PassesList(kAlt | kShift, true));
  EXPECT_FALSE(PassesList(kShift, true));
  EXPECT_FALSE(PassesList(kNoShift, true));
  EXPECT_FALSE(PassesList(kCtrl, false));
}

TEST(LabelAsButton, Has_a_handler_or_the_face_of_a_button) {
  DialogForm form;
  Label text(form, u"text");
  Label face(form, u"face");
  face.Style = Label::Look::Button;
  form.ok.Click = [] {};

  EXPECT_FALSE(text.IsButton());
  EXPECT_TRUE(face.IsButton());
  EXPECT_TRUE(form.ok.IsButton());
}

} // namespace
} // namespace quendra::forms
