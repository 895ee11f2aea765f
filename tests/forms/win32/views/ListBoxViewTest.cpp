#include "forms/view/Palette.h"
#include "forms/win32/views/ViewFixture.h"

namespace quendra::forms::win32 {

class ListBoxWindow : public ViewFixture {
 protected:
  ListBoxWindow() {
    form.design = [this] { list.Move(0, 0, 6000, 3000); };
    list.AddItem(u"אטום");
    list.AddItem(u"eth0 (10.0.0.5)");
    list.Click = [this] { chosen.push_back(list.ListIndex()); };
  }
  LRESULT Ask(UINT message, WPARAM wParam = 0) { return ::SendMessageW(Inner(list), message, wParam, 0); }
  Spot PlaceOf(int item) { return {100, static_cast<int>(Ask(LB_GETITEMHEIGHT)) * item + 5}; }

  ListBox list{form, u"lstNICs"};
  std::vector<int> chosen;
};

TEST_F(ListBoxWindow, Shows_its_items_and_no_choice) {
  Show();

  EXPECT_EQ(Ask(LB_GETCOUNT), 2);
  EXPECT_EQ(Ask(LB_GETCURSEL), -1);
}

TEST_F(ListBoxWindow, A_click_of_the_mouse_chooses_once_and_again_on_what_is_chosen) {
  Show();

  Click(Inner(list), PlaceOf(1));
  Click(Inner(list), PlaceOf(1));

  EXPECT_EQ(chosen, (std::vector<int>{1, 1}));
  EXPECT_EQ(Ask(LB_GETCURSEL), 1);
}

TEST_F(ListBoxWindow, A_click_comes_when_the_window_has_let_go_of_the_mouse) {
  HWND captured = nullptr;
  list.Click = [&] {
    captured = ::GetCapture();
    chosen.push_back(list.ListIndex());
  };
  Show();

  Click(Inner(list), PlaceOf(1));

  EXPECT_EQ(chosen, std::vector<int>{1});
  EXPECT_EQ(captured, nullptr);
}

TEST_F(ListBoxWindow, A_click_below_the_last_item_leaves_the_choice_as_it_is) {
  Show();
  list.SelectItem(0);

  Click(Inner(list), {100, 150});

  EXPECT_EQ(list.ListIndex(), 0);
  EXPECT_EQ(Ask(LB_GETCURSEL), 0);
}

TEST_F(ListBoxWindow, A_double_click_is_told_as_one) {
  int doubled = 0;
  list.DoubleClick = [&] { ++doubled; };
  Show();

  Click(Inner(list), PlaceOf(0));
  Press(Inner(list), PlaceOf(0), WM_LBUTTONDBLCLK);
  Press(Inner(list), PlaceOf(0), WM_LBUTTONUP, 0);

  EXPECT_EQ(doubled, 1);
  EXPECT_EQ(chosen, std::vector<int>{0});
}

TEST_F(ListBoxWindow, A_key_that_the_system_moves_by_chooses_with_a_click_too) {
  list.AddItem(u"wlan0");
  Show();
  list.SelectItem(0);

  Key(kPageDownKey);

  EXPECT_EQ(chosen, (std::vector<int>{0, 2}));
}

TEST_F(ListBoxWindow, Emptying_and_filling_reach_the_window) {
  Show();
  list.SelectItem(1);

  list.Clear();
  EXPECT_EQ(Ask(LB_GETCOUNT), 0);
  list.AddItem(u"wlan0");

  EXPECT_EQ(Ask(LB_GETCOUNT), 1);
  EXPECT_EQ(Ask(LB_GETCURSEL), -1);
}

TEST_F(ListBoxWindow, The_chosen_item_has_the_ground_of_the_house) {
  Show();
  list.SelectItem(1);

  EXPECT_EQ(PixelIn(Inner(list), 20, PlaceOf(0).top), Palette::Page);
  EXPECT_EQ(PixelIn(Inner(list), 20, PlaceOf(1).top), Palette::Selection);
}

TEST_F(ListBoxWindow, An_item_with_harmful_characters_shows_them_as_signs) {
  list.AddItem(u"a\u202Eb\n");
  Show();

  wchar_t shown[16] = {};
  ::SendMessageW(Inner(list), LB_GETTEXT, 2, reinterpret_cast<LPARAM>(shown));

  EXPECT_EQ(winapi::TextOf(shown), u"a\uFFFDb\u240A");
}

} // namespace quendra::forms::win32
