#include "forms/suite/DesktopSuite.h"

#include "forms/view/Keyboard.h"

namespace quendra::forms {

namespace {

/// A list of three, before a button.
struct Choice {
  explicit Choice(TracedForm& owner) : form(owner) {
    list.Move(150, 600, 3000, 1500);
    list.TabIndex = -2;
    button.Move(150, 2400, 1500, 450);
    button.TabIndex = -1;
    for (const char16_t* item : {u"one", u"two", u"three"}) list.AddItem(item);
    list.Click = [this] { chosen.push_back(list.ListIndex()); };
    button.Click = [] {};
  }
  TracedForm& form;
  ListBox list{form, u"list"};
  CommandButton button{form, u"button"};
  std::vector<int> chosen;
};

} // namespace

TEST_P(DesktopSuite, A_list_box_that_gets_the_focus_chooses_nothing_by_itself) {
  Choice choice(form);

  ShowActive(form);

  EXPECT_EQ(user->Focused(form), &choice.list);
  EXPECT_EQ(choice.list.ListIndex(), -1);
  EXPECT_TRUE(choice.chosen.empty());
}

TEST_P(DesktopSuite, Arrows_Home_and_End_choose_in_a_list_box_with_a_click_for_each_choice) {
  Choice choice(form);
  ShowActive(form);

  for (const int key : {kDownKey, kDownKey, kUpKey, kEndKey, kDownKey, kHomeKey, kUpKey})
    user->PressKey(form, key);

  EXPECT_EQ(choice.chosen, (std::vector<int>{0, 1, 0, 2, 0}));
}

TEST_P(DesktopSuite, Tab_leaves_a_list_box_with_its_choice) {
  Choice choice(form);
  ShowActive(form);
  user->PressKey(form, kEndKey);

  user->PressKey(form, kTabKey);

  EXPECT_EQ(user->Focused(form), &choice.button);
  EXPECT_EQ(choice.list.ListIndex(), 2);
}

TEST_P(DesktopSuite, Enter_and_Escape_in_a_list_box_press_what_its_form_has_for_them) {
  Choice choice(form);
  int pressed = 0;
  choice.button.Click = [&] { ++pressed; };
  form.Default = form.Cancel = &choice.button;
  ShowActive(form);

  user->PressKey(form, kEnterKey);
  user->PressKey(form, kEscapeKey);

  EXPECT_EQ(pressed, 2);
}

TEST_P(DesktopSuite, A_list_box_that_was_filled_and_emptied_while_it_shows_takes_keys_for_what_it_holds_now) {
  Choice choice(form);
  ShowActive(form);
  choice.list.SelectItem(2);
  choice.list.Clear();
  user->PressKey(form, kDownKey);
  EXPECT_EQ(choice.list.ListIndex(), -1);

  choice.list.AddItem(u"alone");
  user->PressKey(form, kEndKey);

  EXPECT_EQ(choice.list.ListIndex(), 0);
}

} // namespace quendra::forms
