#include "forms/win32/views/ViewFixture.h"
#include "forms/win32/views/list/ListViewView.h"

namespace quendra::forms::win32 {

class Tips : public ViewFixture {
 protected:
  Tips() {
    form.design = [this] {
      label.Move(0, 0, 1200, 300);
      list.Move(0, 600, 6000, 1500);
      box.Move(0, 2400, 1500, 1500);
    };
    list.HeaderIcons = &icons;
    icons.Add(Picture::Of({1, 1, {0xFFFF0000}}));
    list.AddColumn({u"שם", 1500});
    list.AddColumn({u"", 1500, Alignment::Centre, 1, u"העלאה"});
    list.Add(u"k1", kLong, 0).AddCell(u"short");
    box.AddItem(u"short");
    box.AddItem(kLong);
  }

  const HoverTip& Tip() { return ViewOf(label).Context().state.tip; }
  /// What is shown once the mouse rests at a place of a window, as its messages tell it.
  Text At(HWND window, Spot place) {
    Press(window, place, WM_MOUSEMOVE, 0);
    Press(window, place, WM_MOUSEHOVER, 0);
    return Tip().Shown();
  }

  static constexpr const char16_t* kLong = u"a name that is much longer than its place";
  Label label{form, u"label"};
  ImageList icons{form, u"icons"};
  ListView list{form, u"list"};
  ListBox box{form, u"box"};
};

TEST_F(Tips, A_label_that_is_cut_is_shown_whole_and_one_that_fits_is_not) {
  label.Caption = u"short";
  Show();
  const HWND window = ViewOf(label).Window();
  EXPECT_EQ(At(window, {5, 5}), u"");

  label.Caption = kLong;
  EXPECT_EQ(At(window, {5, 5}), kLong);
  EXPECT_TRUE(::IsWindowVisible(Tip().Window()));

  label.WordWrap = true;
  EXPECT_EQ(At(window, {5, 5}), u"");
  EXPECT_FALSE(::IsWindowVisible(Tip().Window()));
}

TEST_F(Tips, A_cell_that_is_cut_and_a_header_of_an_icon_alone_are_told) {
  Show();
  Settle();
  const HWND window = Inner(list);
  const int row = As<ListViewView>(list).PlaceOfRow(0).corner.top + 5;

  // Places of a mirrored window count from the right.
  EXPECT_EQ(At(window, {50, row}), kLong);
  EXPECT_EQ(At(window, {150, row}), u"");
  EXPECT_EQ(At(window, {250, row}), u"");
  EXPECT_EQ(At(window, {50, row + 200}), u"");
  EXPECT_EQ(At(As<ListViewView>(list).Header(), {150, 10}), u"העלאה");
  EXPECT_EQ(At(As<ListViewView>(list).Header(), {50, 10}), u"");
}

TEST_F(Tips, An_item_of_a_list_box_that_is_cut_is_told) {
  Show();
  const int height = static_cast<int>(::SendMessageW(Inner(box), LB_GETITEMHEIGHT, 0, 0));

  EXPECT_EQ(At(Inner(box), {5, height / 2}), u"");
  EXPECT_EQ(At(Inner(box), {5, height * 3 / 2}), kLong);
  EXPECT_EQ(At(Inner(box), {5, height * 5 / 2}), u"");
}

TEST_F(Tips, What_is_shown_goes_when_the_mouse_does_with_a_press_and_with_the_form) {
  label.Caption = kLong;
  Show();
  const HWND window = ViewOf(label).Window();

  At(window, {5, 5});
  Press(window, {}, WM_MOUSELEAVE, 0);
  EXPECT_EQ(Tip().Shown(), u"");

  EXPECT_EQ(At(window, {5, 5}), kLong);
  Press(window, {5, 5});
  EXPECT_EQ(Tip().Shown(), u"");

  EXPECT_EQ(At(window, {5, 5}), kLong);
  form.Visible = false;
  EXPECT_FALSE(::IsWindowVisible(Tip().Window()));
}

TEST_F(Tips, A_tip_at_the_edge_of_the_screen_stays_on_it_and_beside_the_mouse) {
  label.Caption = kLong;
  Show();
  const Area screen = WindowOf(form).UsableScreen();
  const POINT mouse{screen.Right() - 3, screen.Bottom() - 3};

  ::SetCursorPos(mouse.x, mouse.y);
  ASSERT_EQ(At(ViewOf(label).Window(), {5, 5}), kLong);
  ::SetCursorPos(0, 0);

  RECT shown{};
  ASSERT_TRUE(::GetWindowRect(Tip().Window(), &shown));
  EXPECT_LT(shown.left, shown.right);
  EXPECT_GT(shown.top, screen.Bottom() - 100);
  EXPECT_LE(shown.right, screen.Right());
  EXPECT_LE(shown.bottom, screen.Bottom());
  EXPECT_GE(shown.left, screen.corner.left);
  EXPECT_FALSE(::PtInRect(&shown, mouse));
}

TEST_F(Tips, A_mouse_that_rests_brings_up_the_tip_beside_it) {
  label.Caption = kLong;
  Show();
  RECT place{};
  ::GetWindowRect(ViewOf(label).Window(), &place);

  ::SetCursorPos(place.left + 10, place.top + 5);
  ASSERT_TRUE(user.WaitUntil([&] { return !Tip().Shown().empty(); }));

  RECT shown{};
  ::GetWindowRect(Tip().Window(), &shown);
  EXPECT_EQ(Tip().Shown(), kLong);
  EXPECT_GT(shown.right - shown.left, 100);
  EXPECT_GT(shown.top, place.top + 5);
  ::SetCursorPos(0, 0);
  EXPECT_TRUE(user.WaitUntil([&] { return Tip().Shown().empty(); }));
}

} // namespace quendra::forms::win32
