#include "forms/suite/DesktopSuite.h"

#include "forms/view/FocusOrder.h"

namespace quendra::forms {

// Focus and keys.

namespace {

/// Two buttons, a table and a text in a form; the order of Tab is first, list, last.
struct Dialog {
  explicit Dialog(TracedForm& owner) : form(owner) {
    list.TabIndex = 1;
    last.TabIndex = 2;
    first.Click = [this] { pressed += "first "; };
    last.Click = [this] { pressed += "last "; };
    list.AddColumn({u"name", 1500});
  }
  /// Presses Tab so often and tells where that led.
  std::vector<Text> Tabs(DesktopDriver& user, int count, int shift = kNoShift) {
    std::vector<Text> reached;
    for (int i = 0; i < count; ++i) {
      user.PressKey(form, kTabKey, shift);
      const Control* focused = user.Focused(form);
      reached.push_back(focused ? focused->Name() : u"");
    }
    return reached;
  }

  TracedForm& form;
  Label last{form, u"last"};
  Frame page{form, u"page"};
  Label first{page, u"first"};
  Label text{page, u"text"};
  ListView list{form, u"list"};
  std::string pressed;
};

using Names = std::vector<Text>;

} // namespace

TEST_P(DesktopSuite, The_first_control_of_the_tab_order_has_the_focus_when_a_form_comes_up) {
  Dialog dialog(form);

  ShowActive(form);

  EXPECT_TRUE(user->WaitUntil([&] { return user->Focused(form) == &dialog.first; }));
}

TEST_P(DesktopSuite, Tab_follows_the_tab_index_and_then_the_order_in_the_form) {
  Dialog dialog(form);
  ShowActive(form);

  EXPECT_EQ(dialog.Tabs(*user, 4), (Names{u"list", u"last", u"first", u"list"}));
}

TEST_P(DesktopSuite, Shift_and_Tab_go_the_other_way) {
  Dialog dialog(form);
  ShowActive(form);

  EXPECT_EQ(dialog.Tabs(*user, 3, kShift), (Names{u"last", u"list", u"first"}));
}

TEST_P(DesktopSuite, Hidden_and_disabled_labels_are_passed_over) {
  Dialog dialog(form);
  Label hidden(form, u"hidden");
  Label disabled(form, u"disabled");
  hidden.TabIndex = disabled.TabIndex = 1;
  hidden.Click = disabled.Click = [] {};
  hidden.Visible = false;
  disabled.Enabled = false;
  ShowActive(form);

  EXPECT_EQ(dialog.Tabs(*user, 3), (Names{u"list", u"last", u"first"}));
}

TEST_P(DesktopSuite, A_form_where_nothing_takes_the_focus_comes_up_all_the_same) {
  ShowActive(form);

  EXPECT_TRUE(user->Stands(form));
  EXPECT_EQ(user->Focused(form), nullptr);
}

TEST_P(DesktopSuite, Enter_and_Space_press_a_label) {
  Dialog dialog(form);
  ShowActive(form);

  user->PressKey(form, kEnterKey);
  EXPECT_EQ(dialog.pressed, "first ");
  user->PressKey(form, kSpaceKey);
  EXPECT_EQ(dialog.pressed, "first first ");
  user->PressKey(form, 'A');

  EXPECT_EQ(dialog.pressed, "first first ");
}

TEST_P(DesktopSuite, Keys_with_Alt_press_no_label) {
  Dialog dialog(form);
  ShowActive(form);

  user->PressKey(form, kEnterKey, kAlt);
  EXPECT_EQ(dialog.pressed, "");
  user->PressKey(form, kEnterKey);

  EXPECT_EQ(dialog.pressed, "first ");
}

TEST_P(DesktopSuite, Enter_presses_the_label_that_has_the_focus_and_not_the_default_one) {
  Dialog dialog(form);
  form.Default = &dialog.last;
  ShowActive(form);

  user->PressKey(form, kEnterKey);

  EXPECT_EQ(dialog.pressed, "first ");
}

TEST_P(DesktopSuite, Escape_clicks_the_cancel_control_wherever_the_focus_is) {
  Dialog dialog(form);
  form.Cancel = &dialog.last;
  ShowActive(form);

  for (int i = 0; i < 3; ++i) {
    user->PressKey(form, kEscapeKey);
    dialog.Tabs(*user, 1);
  }

  EXPECT_EQ(dialog.pressed, "last last last ");
}

TEST_P(DesktopSuite, Escape_and_Enter_click_in_a_form_where_nothing_takes_the_focus) {
  Image picture(form, u"picture");
  int clicks = 0;
  picture.Click = [&] { ++clicks; };
  form.Default = form.Cancel = &picture;
  ShowActive(form);

  user->PressKey(form, kEscapeKey);
  user->PressKey(form, kEnterKey);
  EXPECT_EQ(clicks, 2);
  user->PressKey(form, kEscapeKey, kCtrl);

  EXPECT_EQ(clicks, 2);
}

TEST_P(DesktopSuite, Keys_reach_a_form_with_a_preview_once_and_before_its_control) {
  Dialog dialog(form);
  dialog.first.Click = [this] { form.Say("click"); };
  form.KeyPreview = true;
  ShowActive(form);
  trace.clear();

  user->PressKey(form, kSpaceKey);
  user->PressKey(form, 'I', kCtrl);

  EXPECT_EQ(trace, (Trace{"frmOne key 32 0", "frmOne click", "frmOne key 73 2"}));
}

TEST_P(DesktopSuite, A_key_of_the_form_types_nothing_when_its_handler_waits_until_Ctrl_is_let_go) {
  TextBox field(form, u"field");
  field.Move(0, 600, 3000, 450);
  form.KeyPreview = true;
  form.onKey = [this] { desktop.DoEvents(); };
  ShowActive(form);
  trace.clear();

  user->PressKey(form, 'I', kCtrl);

  EXPECT_EQ(trace, (Trace{"frmOne key 73 2"}));
  EXPECT_EQ(field.Value(), u"");
}

TEST_P(DesktopSuite, Keys_of_a_control_pass_a_form_without_a_preview) {
  Dialog dialog(form);
  ShowActive(form);
  trace.clear();

  user->PressKey(form, 'A');

  EXPECT_TRUE(trace.empty());
}

TEST_P(DesktopSuite, Escape_may_unload_the_form_that_it_reached) {
  desktop.Show(other);
  Image picture(form, u"picture");
  picture.Click = [&] { desktop.Unload(form); };
  form.Cancel = &picture;
  ShowActive(form);

  user->PressKey(form, kEscapeKey);

  EXPECT_FALSE(form.IsLoaded());
}

} // namespace quendra::forms
