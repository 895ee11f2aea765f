#include "forms/view/Palette.h"
#include "forms/win32/views/FieldWindowsFixture.h"

namespace quendra::forms::win32 {

TEST_F(FieldWindows, A_combo_box_turns_when_its_own_handlers_are_through) {
  Show();
  Key(kTabKey);
  Key(kTabKey);
  const HWND before = Edit();
  bool stood = false;
  combo.KeyPress = [&](int& keyCode) {
    keyCode = 0;
    combo.Value = u"שלום";
    desktop.PumpOnce();
    stood = ::IsWindow(before);
  };

  Key('A');
  EXPECT_TRUE(stood);
  Settle();

  EXPECT_TRUE(::GetWindowLongW(Edit(), GWL_EXSTYLE) & WS_EX_RTLREADING);
}

TEST_F(FieldWindows, The_text_of_a_combo_box_is_named_by_a_label_right_before_it_also_when_it_has_turned) {
  combo.Description = u"כתובת לבדיקה";
  Show();
  const auto name = [this] { return TextOfWindow(::GetWindow(Edit(), GW_HWNDPREV)); };
  EXPECT_EQ(name(), u"כתובת לבדיקה");

  combo.Value = u"שלום";
  Settle();

  EXPECT_EQ(name(), u"כתובת לבדיקה");
}

TEST_F(FieldWindows, A_combo_box_has_the_ring_of_all_fields_for_those_who_use_the_keys) {
  for (const bool freeText : {true, false}) {
    combo.FreeText = freeText;
    Show();
    const HWND window = As<FieldView>(combo).Window();
    EXPECT_EQ(PixelIn(window, 100, 1), Palette::Page);

    Key(kTabKey);
    Key(kTabKey);

    EXPECT_EQ(PixelIn(window, 100, 1), Palette::Focus) << freeText;
    desktop.Unload(form);
  }
}

TEST_F(FieldWindows, An_item_that_is_chosen_by_the_arrows_stands_in_the_field) {
  std::vector<int> chosen;
  combo.Click = [&] { chosen.push_back(combo.ListIndex()); };
  Show();
  Key(kTabKey);
  Key(kTabKey);

  Key(kDownKey);
  Settle();

  EXPECT_EQ(chosen, std::vector<int>{0});
  EXPECT_EQ(combo.Value(), u"www.one.test");
  EXPECT_EQ(TextOfWindow(Edit()), u"www.one.test");
}

TEST_F(FieldWindows, A_combo_box_turns_to_the_direction_of_its_text_and_keeps_caret_and_focus) {
  Show();
  Key(kTabKey);
  Key(kTabKey);
  const auto isTurned = [this] {
    constexpr LONG kTurned = WS_EX_RTLREADING | WS_EX_RIGHT;
    return (::GetWindowLongW(Edit(), GWL_EXSTYLE) & kTurned) == kTurned;
  };
  EXPECT_FALSE(isTurned());

  combo.Value = u"שלום, abc";
  combo.SelStart = 3;
  Settle();
  EXPECT_TRUE(isTurned());
  EXPECT_EQ(::GetFocus(), Edit());
  EXPECT_EQ(WindowWithCaret(), Edit());
  Key('X');
  EXPECT_EQ(combo.Value(), u"שלוXם, abc");

  combo.SelectItem(0);
  Settle();
  EXPECT_FALSE(isTurned());
  EXPECT_EQ(TextOfWindow(Edit()), u"www.one.test");
  combo.Enabled = false;
  EXPECT_FALSE(::IsWindowEnabled(Edit()));
}

TEST_F(FieldWindows, A_list_with_free_text_hangs_down_by_its_keys_and_gives_the_focus_back) {
  std::vector<int> chosen;
  combo.Click = [&] { chosen.push_back(combo.ListIndex()); };
  Show();
  Key(kTabKey);
  Key(kTabKey);
  constexpr int kF4Key = kF1Key + 3;

  ::SendMessageW(Edit(), WM_KEYDOWN, kF4Key, 0);
  EXPECT_TRUE(::SendMessageW(Inner(combo), CB_GETDROPPEDSTATE, 0, 0));
  Key(kDownKey);
  Key(kDownKey);
  Key(kEnterKey);
  Settle();

  EXPECT_EQ(chosen, std::vector<int>{1});
  EXPECT_EQ(combo.Value(), u"www.two.test");
  EXPECT_EQ(::GetFocus(), Edit());

  ::SendMessageW(Edit(), WM_SYSKEYDOWN, VK_DOWN, 1 << 29);
  EXPECT_TRUE(::SendMessageW(Inner(combo), CB_GETDROPPEDSTATE, 0, 0));
  Key(kEscapeKey);
  Settle();
  EXPECT_EQ(::GetFocus(), Edit());
  EXPECT_EQ(chosen.size(), 1U);
}

TEST_F(FieldWindows, An_item_is_chosen_by_a_press_on_the_closed_list_that_is_let_go_over_the_item) {
  std::vector<int> chosen;
  for (const char16_t* more : {u"www.three.test", u"www.four.test"}) combo.AddItem(more);
  combo.FreeText = false;
  combo.Click = [&] { chosen.push_back(combo.ListIndex()); };
  Show();
  const HWND window = Inner(combo);
  COMBOBOXINFO parts{};
  parts.cbSize = sizeof parts;
  ::GetComboBoxInfo(window, &parts);
  // As the system gives them: to the window that has the mouse to itself, else to the one under it.
  const auto tell = [&](UINT message, WPARAM held) {
    const HWND to = ::GetCapture() ? ::GetCapture() : parts.hwndList;
    POINT place{20, static_cast<int>(::SendMessageW(window, CB_GETITEMHEIGHT, 0, 0)) + 5};
    ::MapWindowPoints(parts.hwndList, to, &place, 1);
    Press(to, {static_cast<int>(place.x), static_cast<int>(place.y)}, message, held);
  };

  Press(window, {10, 10});
  ASSERT_TRUE(::SendMessageW(window, CB_GETDROPPEDSTATE, 0, 0));
  tell(WM_MOUSEMOVE, MK_LBUTTON);
  tell(WM_MOUSEMOVE, MK_LBUTTON);
  tell(WM_LBUTTONUP, 0);
  Settle();

  EXPECT_EQ(chosen, std::vector<int>{1});
  EXPECT_FALSE(::SendMessageW(window, CB_GETDROPPEDSTATE, 0, 0));
}

TEST_F(FieldWindows, The_wheel_over_a_closed_list_changes_nothing) {
  combo.FreeText = false;
  Show();
  combo.SelectItem(0);

  ::SendMessageW(Inner(combo), WM_MOUSEWHEEL, MAKEWPARAM(0, static_cast<WORD>(-WHEEL_DELTA)), 0);
  Settle();

  EXPECT_EQ(combo.ListIndex(), 0);
}

TEST_F(FieldWindows, A_combo_box_fills_the_height_that_it_was_given) {
  for (const bool freeText : {true, false}) {
    combo.FreeText = freeText;
    Show();
    RECT field{};
    RECT inner{};
    ::GetWindowRect(As<FieldView>(combo).Window(), &field);
    ::GetWindowRect(Inner(combo), &inner);

    EXPECT_EQ(field.bottom - field.top, 30);
    EXPECT_EQ(inner.top - field.top, field.bottom - inner.bottom) << freeText;
    desktop.Unload(form);
  }
}

TEST_F(FieldWindows,
       A_list_that_hangs_down_tells_of_the_choice_when_it_is_made_and_of_none_that_was_given_up) {
  std::vector<int> chosen;
  combo.FreeText = false;
  combo.Click = [&] { chosen.push_back(combo.ListIndex()); };
  Show();
  const HWND window = Inner(combo);
  Click(window, {10, 10});
  EXPECT_TRUE(::SendMessageW(window, CB_GETDROPPEDSTATE, 0, 0));

  Key(kDownKey);
  Key(kDownKey);
  Settle();
  EXPECT_TRUE(chosen.empty());
  Key(kEnterKey);
  Settle();
  EXPECT_EQ(chosen, std::vector<int>{1});

  Click(window, {10, 10});
  Key(kUpKey);
  Key(kEscapeKey);
  Settle();
  EXPECT_EQ(chosen, std::vector<int>{1});
  EXPECT_EQ(::SendMessageW(window, CB_GETCURSEL, 0, 0), 1);
}

} // namespace quendra::forms::win32
