#include "forms/suite/DesktopSuite.h"

#include "forms/view/Keyboard.h"

namespace quendra::forms {

// Fields that are typed into, buttons, and what a desktop shows while the thread is held.

namespace {

/// A field, a list with free text and a button; the order of Tab is as they stand.
struct Fields {
  explicit Fields(TracedForm& owner) : form(owner) {
    int top = 600;
    for (Control* control : std::vector<Control*>{&line, &lines, &combo, &button})
      control->Move(150, std::exchange(top, top + 900), 3000, 750);
    line.TabIndex = 1;
    lines.TabIndex = 2;
    combo.TabIndex = 3;
    button.TabIndex = 4;
    lines.MultiLine = true;
    combo.FreeText = true;
    combo.AddItem(u"www.one.test");
    combo.AddItem(u"www.two.test");
    button.Click = [this] { ++clicks; };
  }
  TracedForm& form;
  TextBox line{form, u"line"};
  TextBox lines{form, u"lines"};
  ComboBox combo{form, u"combo"};
  CommandButton button{form, u"button"};
  int clicks = 0;
};

} // namespace

TEST_P(DesktopSuite, What_is_typed_stands_in_the_field_and_is_told_each_time) {
  Fields fields(form);
  std::vector<Text> told;
  fields.line.Change = [&] { told.push_back(fields.line.Value()); };
  ShowActive(form);

  for (const char16_t character : {u'A', u'\u05D0', u'1'}) user->PressKey(form, character);

  EXPECT_EQ(told, (std::vector<Text>{u"A", u"A\u05D0", u"A\u05D01"}));
  EXPECT_EQ(fields.line.SelStart(), 3);
}

TEST_P(DesktopSuite, A_key_press_gives_the_characters_number_and_may_change_or_swallow_it) {
  Fields fields(form);
  std::vector<int> pressed;
  fields.line.KeyPress = [&](int& keyCode) {
    pressed.push_back(keyCode);
    if (keyCode == 0x05D0) keyCode = 't';
    if (keyCode == 0x05E9) keyCode = 0;
  };
  ShowActive(form);

  for (const int key : {0x05D0, 0x05E9, 0x05EA, static_cast<int>(kBackspaceKey)}) user->PressKey(form, key);

  EXPECT_EQ(pressed, (std::vector<int>{0x05D0, 0x05E9, 0x05EA, 8}));
  EXPECT_EQ(fields.line.Value(), u"t");
}

TEST_P(DesktopSuite, A_swallowed_key_changes_nothing) {
  Fields fields(form);
  int changes = 0;
  fields.line.KeyPress = [](int& keyCode) { keyCode = 0; };
  fields.line.Change = [&] { ++changes; };
  ShowActive(form);

  user->PressKey(form, 'A');
  user->PressKey(form, kBackspaceKey);

  EXPECT_EQ(fields.line.Value(), u"");
  EXPECT_EQ(changes, 0);
}

TEST_P(DesktopSuite, Tab_moves_on_from_a_field_and_is_no_key_press) {
  Fields fields(form);
  int pressed = 0;
  fields.line.KeyPress = fields.lines.KeyPress = fields.combo.KeyPress = [&](int&) { ++pressed; };
  ShowActive(form);
  std::vector<Text> reached;
  for (int i = 0; i < 4; ++i) {
    user->PressKey(form, kTabKey);
    reached.push_back(user->Focused(form)->Name());
  }

  EXPECT_EQ(reached, (std::vector<Text>{u"lines", u"combo", u"button", u"line"}));
  EXPECT_EQ(pressed, 0);
}

TEST_P(DesktopSuite, A_field_tells_that_the_focus_came_once_each_time) {
  Fields fields(form);
  std::string came;
  fields.line.GotFocus = [&] { came += "line "; };
  fields.combo.GotFocus = [&] { came += "combo "; };
  ShowActive(form);
  EXPECT_TRUE(user->WaitUntil([&] { return came == "line "; })) << came;

  for (int i = 0; i < 4; ++i) user->PressKey(form, kTabKey);

  EXPECT_EQ(came, "line combo line ");
}

TEST_P(DesktopSuite, What_is_selected_when_the_focus_comes_is_replaced_by_typing) {
  Fields fields(form);
  fields.combo.Value = u"www.one.test";
  fields.combo.GotFocus = [&] {
    fields.combo.SelStart = 0;
    fields.combo.SelLength = static_cast<int>(fields.combo.Value().size());
  };
  ShowActive(form);
  user->PressKey(form, kTabKey);
  user->PressKey(form, kTabKey);

  user->PressKey(form, 'X');

  EXPECT_EQ(fields.combo.Value(), u"X");
  EXPECT_EQ(fields.combo.ListIndex(), -1);
}

TEST_P(DesktopSuite, Enter_begins_a_line_in_a_field_of_many_and_none_in_one_of_a_single) {
  Fields fields(form);
  ShowActive(form);
  for (const int key : {static_cast<int>('A'), static_cast<int>(kEnterKey), static_cast<int>('B')})
    user->PressKey(form, key);
  user->PressKey(form, kTabKey);
  for (const int key : {static_cast<int>('A'), static_cast<int>(kEnterKey), static_cast<int>('B')})
    user->PressKey(form, key);

  EXPECT_EQ(fields.line.Value(), u"AB");
  EXPECT_EQ(fields.lines.Value(), u"A\r\nB");
  EXPECT_EQ(fields.lines.SelStart(), 4);
}

TEST_P(DesktopSuite, Enter_in_a_field_clicks_the_default_control_and_types_nothing) {
  Fields fields(form);
  int pressed = 0;
  fields.line.KeyPress = [&](int&) { ++pressed; };
  form.Default = &fields.button;
  ShowActive(form);

  user->PressKey(form, kEnterKey);

  EXPECT_EQ(fields.clicks, 1);
  EXPECT_EQ(pressed, 0);
}

TEST_P(DesktopSuite, A_text_that_a_handler_puts_into_its_field_stands_there_when_typing_goes_on) {
  Fields fields(form);
  fields.line.Change = [&] {
    if (fields.line.Value() != u"A") return;
    fields.line.Value = u"xyz";
    fields.line.SelStart = 3;
  };
  ShowActive(form);

  user->PressKey(form, 'A');
  user->PressKey(form, 'B');

  EXPECT_EQ(fields.line.Value(), u"xyzB");
}

TEST_P(DesktopSuite, A_field_that_can_only_be_read_stays_as_it_is) {
  Fields fields(form);
  fields.line.ReadOnly = true;
  fields.line.Value = u"fixed";
  ShowActive(form);

  user->PressKey(form, 'A');
  user->PressKey(form, kBackspaceKey);

  EXPECT_EQ(fields.line.Value(), u"fixed");
}

TEST_P(DesktopSuite, A_key_press_may_unload_the_form_of_its_field) {
  desktop.Show(other);
  Fields fields(form);
  fields.line.KeyPress = [&](int&) { desktop.Unload(form); };
  ShowActive(form);

  user->PressKey(form, 'A');

  EXPECT_FALSE(form.IsLoaded());
  EXPECT_EQ(fields.line.Value(), u"");
}

TEST_P(DesktopSuite, A_command_button_is_pressed_by_the_mouse_and_by_keys) {
  Fields fields(form);
  fields.button.TabIndex = 0;
  ShowActive(form);

  user->Click(fields.button);
  user->PressKey(form, kEnterKey);
  user->PressKey(form, kSpaceKey);

  EXPECT_EQ(fields.clicks, 3);
}

TEST_P(DesktopSuite, Painting_at_once_handles_no_message) {
  Fields fields(form);
  ShowActive(form);
  bool handled = false;
  loop.Post([&] { handled = true; });

  desktop.Repaint(fields.lines);
  desktop.Repaint(form);
  EXPECT_FALSE(handled);

  EXPECT_TRUE(user->WaitUntil([&] { return handled; }));
}

TEST_P(DesktopSuite, Messages_of_a_form_reach_the_procedure_that_replaced_its_own) {
  desktop.Show(form);
  const WindowHandle window = desktop.HandleOf(form);
  std::vector<std::uint32_t> seen;
  using Procedure = WindowProcedure::element_type;
  desktop.Windows.Replace(window, std::make_shared<Procedure>([&](auto, std::uint32_t message, auto...) {
                            seen.push_back(message);
                            return 5;
                          }));

  EXPECT_EQ(desktop.SendMessage(window, 1025, 0, 1), 5);
  loop.PostMessage(window, 1026, 0, 1);
  EXPECT_TRUE(user->WaitUntil([&] { return seen.size() == 2; }));

  EXPECT_EQ(seen, (std::vector<std::uint32_t>{1025, 1026}));
}

TEST_P(DesktopSuite, A_procedure_without_a_predecessor_or_that_is_its_own_passes_a_message_to_the_forms_own) {
  desktop.Show(form);
  const WindowHandle window = desktop.HandleOf(form);
  int calls = 0;
  WindowProcedure previous;
  using Procedure = WindowProcedure::element_type;
  const auto passing = std::make_shared<Procedure>([&](auto sentTo, auto... rest) {
    ++calls;
    return desktop.Windows.Call(previous, sentTo, rest...);
  });
  const WindowProcedure own = desktop.Windows.Replace(window, passing);
  const std::int32_t answer = desktop.Windows.Call(own, window, 1025, 0, 1);

  for (const WindowProcedure& predecessor : {WindowProcedure(), WindowProcedure(passing)}) {
    previous = predecessor;
    calls = 0;
    EXPECT_EQ(desktop.SendMessage(window, 1025, 0, 1), answer);
    EXPECT_EQ(calls, 1);
    loop.PostMessage(window, 1025, 0, 1);
    EXPECT_TRUE(user->WaitUntil([&] { return calls == 2; }));
  }
  previous = nullptr;
}

TEST_P(DesktopSuite, A_message_for_a_form_that_has_gone_is_lost) {
  desktop.Show(other);
  desktop.Show(form);
  const WindowHandle window = desktop.HandleOf(form);
  desktop.Unload(form);

  EXPECT_EQ(desktop.Windows.Procedure(window), nullptr);
  EXPECT_EQ(desktop.SendMessage(window, 1025, 0, 1), 0);
}

TEST_P(DesktopSuite, A_window_leaves_the_band_above_all_others_without_moving_and_stays_there) {
  ShowActive(form);

  EXPECT_TRUE(desktop.SetWindowPos(desktop.HandleOf(form), InsertAfter::NotTopmost, 0, 0, 0, 0,
                                   kKeepsSize | kKeepsPlace));
  EXPECT_TRUE(user->Stands(form));
  EXPECT_FALSE(desktop.SetWindowPos(kNoWindow, InsertAfter::NotTopmost, 0, 0, 0, 0, kKeepsSize));
}

TEST_P(DesktopSuite, A_question_has_its_sign_and_gives_6_for_yes_and_7_for_no) {
  desktop.Show(form);
  SeenBox seen;
  user->AnswerBox(seen, 6);
  EXPECT_EQ(desktop.MessageBox(u"text", kQuestion | kYesNo | kHebrewBox, u"title"), 6);
  EXPECT_EQ(seen.content.sign, BoxSign::Question);

  user->AnswerBox(seen, 7);
  EXPECT_EQ(desktop.MessageBox(u"text", kExclamation | kYesNo | kHebrewBox, u"title"), 7);
  EXPECT_EQ(seen.content.sign, BoxSign::Exclamation);
}

} // namespace quendra::forms
