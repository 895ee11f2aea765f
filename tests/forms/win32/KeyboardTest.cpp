#include "forms/win32/Win32Fixture.h"

namespace quendra::forms::win32 {

class Keyboard : public Win32Fixture {
 protected:
  Keyboard() {
    first.Click = [this] { pressed += "first "; };
    second.Click = [this] { pressed += "second "; };
    form.design = [this] {
      first.Move(0, 0, 1500, 450);
      second.Move(0, 600, 1500, 450);
    };
  }
  /// A key as its window gets it out of the queue.
  void PostKey(WPARAM key, LPARAM state) {
    ::PostMessageW(::GetFocus(), WM_KEYDOWN, key, state);
    desktop.PumpOnce();
  }

  Label first{form, u"first"};
  Label second{form, u"second"};
  std::string pressed;
};

TEST_F(Keyboard, A_key_that_is_held_down_presses_once) {
  constexpr LPARAM kHeld = 1L << 30;
  ShowActive();

  PostKey(VK_RETURN, 1);
  PostKey(VK_RETURN, 1 | kHeld);
  PostKey(VK_RETURN, 1 | kHeld);

  EXPECT_EQ(pressed, "first ");
}

TEST_F(Keyboard, The_ring_shows_for_those_who_moved_by_Tab) {
  ShowActive();
  EXPECT_FALSE(ViewOf(first).UsesKeys());

  user.PressKey(form, kTabKey);

  EXPECT_TRUE(ViewOf(second).UsesKeys());
  EXPECT_TRUE(ViewOf(second).HasFocus());
}

TEST_F(Keyboard, A_form_that_was_opened_by_the_keys_shows_the_ring_at_once) {
  TestForm other;
  Label button(other, u"button");
  button.Click = [] {};
  bool shows = false;
  ShowActive();
  user.PressKey(form, kTabKey);
  desktop.Post([&] {
    shows = ViewOf(button).UsesKeys();
    desktop.Unload(other);
  });

  desktop.Show(other, Modality::Modal, &form);

  EXPECT_TRUE(shows);
}

TEST_F(Keyboard, The_focus_moves_on_from_a_label_that_is_disabled_or_hidden) {
  ShowActive();
  EXPECT_EQ(user.Focused(form), &first);

  first.Enabled = false;
  EXPECT_EQ(user.Focused(form), &second);
  first.Enabled = true;
  second.Visible = false;

  EXPECT_EQ(user.Focused(form), &first);
}

TEST_F(Keyboard, The_focus_comes_back_with_the_window) {
  TestForm other;
  ShowActive();
  user.PressKey(form, kTabKey);
  desktop.Show(other);
  EXPECT_EQ(::GetActiveWindow(), WindowOf(other).Top());

  ::SetForegroundWindow(WindowOf(form).Top());
  desktop.PumpOnce();

  EXPECT_TRUE(ViewOf(second).HasFocus());
}

TEST_F(Keyboard, Codes_are_those_of_the_character_without_modifiers_and_of_named_keys) {
  KeyInput keys;

  EXPECT_EQ(keys.PressOf('A', 1).code, 'A');
  EXPECT_EQ(keys.PressOf('7', 1).code, '7');
  EXPECT_EQ(keys.PressOf(VK_RETURN, 1).code, kEnterKey);
  EXPECT_EQ(keys.PressOf(VK_DOWN, 1).code, kDownKey);
  EXPECT_EQ(keys.PressOf(VK_F1 + 4, 1).code, kF1Key + 4);
  EXPECT_EQ(keys.PressOf(VK_SHIFT, 1).code, 0);
}

TEST_F(Keyboard, A_character_without_a_key_is_found_where_each_system_tells_it) {
  KeyInput keys;

  EXPECT_EQ(keys.PressOf(MAKEWPARAM(VK_PACKET, 'a'), 1).code, 'A');
  EXPECT_EQ(keys.PressOf(MAKEWPARAM(VK_PACKET, 0x5D0), 1).code, 0x5D0);
  EXPECT_EQ(keys.PressOf(VK_PACKET, MAKELPARAM(1, 0x5D0)).code, 0x5D0);
}

} // namespace quendra::forms::win32
