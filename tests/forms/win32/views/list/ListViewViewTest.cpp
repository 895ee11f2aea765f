#include "forms/win32/views/list/ListViewView.h"

#include "forms/win32/views/list/TableWindowFixture.h"

namespace quendra::forms::win32 {

TEST_F(TableWindow, Rows_that_were_there_before_the_view_are_shown) {
  AddRow(u"alpha");
  AddRow(u"beta");

  Show();

  EXPECT_EQ(Count(), 2);
  EXPECT_EQ(Shown(1, 0), u"beta");
  EXPECT_EQ(Shown(1, 1), u".80.");
  EXPECT_EQ(SelectedRow(), 0);
}

TEST_F(TableWindow, Adding_removing_and_clearing_reach_the_window) {
  Show();
  AddRow(u"alpha");
  AddRow(u"beta");
  EXPECT_EQ(Count(), 2);

  list.Remove(1);
  EXPECT_EQ(Count(), 1);
  EXPECT_EQ(Shown(0, 0), u"beta");

  list.Clear();
  EXPECT_EQ(Count(), 0);
  EXPECT_EQ(SelectedRow(), -1);
}

TEST_F(TableWindow, The_system_counts_with_the_rows_and_the_header_that_are_drawn) {
  AddRow(u"alpha");
  Show();

  RECT first{};
  first.left = LVIR_BOUNDS;
  Ask(LVM_GETITEMRECT, 0, reinterpret_cast<LPARAM>(&first));

  EXPECT_EQ(first.top, View().PlaceOfRow(0).corner.top);
  EXPECT_EQ(first.bottom, View().PlaceOfRow(0).Bottom());
  EXPECT_EQ(HeaderHeight(), View().PlaceOfRow(0).corner.top);
}

TEST_F(TableWindow, The_selection_follows_its_row_through_a_sort) {
  Show();
  AddRow(u"alpha");
  AddRow(u"beta");
  list.Select(&list.Row(1));

  list.Sort(0, SortOrder::Descending);

  EXPECT_EQ(Shown(0, 0), u"beta");
  EXPECT_EQ(SelectedRow(), 1);
  EXPECT_EQ(list.SelectedItem()->Key(), u"palpha");
}

TEST_F(TableWindow, Removing_a_row_above_the_selected_one_keeps_the_selection_on_its_row) {
  Show();
  for (const Text name : {u"a", u"b", u"c"}) AddRow(name);
  list.Select(&list.Row(3));

  list.Remove(1);

  EXPECT_EQ(SelectedRow(), 1);
  EXPECT_EQ(list.SelectedItem()->Key(), u"pc");
}

TEST_F(TableWindow, The_choice_by_keys_becomes_the_lists_selection) {
  Show();
  AddRow(u"alpha");
  AddRow(u"beta");

  Key(kDownKey);

  EXPECT_EQ(list.SelectedItem()->Key(), u"pbeta");
  EXPECT_EQ(SelectedRow(), 1);
}

TEST_F(TableWindow, The_choice_by_the_mouse_does_too_and_stays_in_places_without_a_row) {
  Show();
  AddRow(u"alpha");
  AddRow(u"beta");

  Click(Inner(list), MiddleOf(1));
  EXPECT_EQ(list.SelectedItem()->Key(), u"pbeta");
  Click(Inner(list), MiddleOf(5));

  EXPECT_EQ(list.SelectedItem()->Key(), u"pbeta");
  EXPECT_EQ(SelectedRow(), 1);
}

TEST_F(TableWindow, A_press_of_the_right_button_is_told_with_its_row_selected) {
  Show();
  AddRow(u"alpha");
  AddRow(u"beta");
  int pressed = 0;
  list.MouseDown = [&](int button, int, int, int) { pressed = button; };

  Press(Inner(list), MiddleOf(1), WM_RBUTTONDOWN, MK_RBUTTON);

  EXPECT_EQ(pressed, kRightButton);
  EXPECT_EQ(list.SelectedItem()->Key(), u"pbeta");
}

TEST_F(TableWindow, A_double_click_is_told_as_one) {
  Show();
  AddRow(u"alpha");
  int doubled = 0;
  list.DoubleClick = [&] { ++doubled; };

  Press(Inner(list), MiddleOf(0), WM_LBUTTONDBLCLK);

  EXPECT_EQ(doubled, 1);
}

TEST_F(TableWindow, A_letter_finds_the_next_row_that_begins_with_it) {
  Show();
  for (const Text name : {u"alpha", u"Beta", u"gamma"}) AddRow(name);

  Key('b');

  EXPECT_EQ(list.SelectedItem()->Key(), u"pBeta");
}

TEST_F(TableWindow, Rows_that_move_do_not_scroll_the_view) {
  Show();
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));

  list.Sort(0, SortOrder::Descending);

  EXPECT_EQ(SelectedRow(), 199);
  EXPECT_EQ(Ask(LVM_GETTOPINDEX), 0);
}

TEST_F(TableWindow, A_click_on_a_header_raises_its_columns_number_from_1_and_sorts_nothing) {
  for (const bool fromRight : {true, false}) {
    form.RightToLeft = fromRight;
    Show();
    list.Clear();
    AddRow(u"beta");
    AddRow(u"alpha");
    std::vector<int> clicked;
    list.ColumnClick = [&](int header) { clicked.push_back(header); };

    // A mirrored window counts from the right, as its columns do.
    for (const int place : {50, 150}) Click(View().Header(), {place, 10});

    EXPECT_EQ(clicked, (std::vector<int>{1, 2})) << fromRight;
    EXPECT_EQ(Shown(0, 0), u"beta");
    desktop.Unload(form);
  }
}

TEST_F(TableWindow, Columns_take_their_width_in_twips_and_one_of_2_twips_is_hidden) {
  list.AddColumn({u"שימוש כולל", 2});

  Show();

  EXPECT_EQ(Width(0), 100);
  EXPECT_EQ(Width(1), 100);
  EXPECT_EQ(Width(2), 0);
}

TEST_F(TableWindow, Columns_with_too_little_room_are_shown_in_proportion_and_need_no_scroll_bar) {
  list.AddColumn({u"יוצר", 6000});

  Show();

  EXPECT_EQ(Width(0) + Width(1) + Width(2), Inside().width);
  EXPECT_NEAR(Width(0), Inside().width / 6.0, 1);
  EXPECT_FALSE(::GetWindowLongW(Inner(list), GWL_STYLE) & WS_HSCROLL);
}

TEST_F(TableWindow, Columns_in_proportion_make_room_for_the_scroll_bar_of_many_rows) {
  list.AddColumn({u"יוצר", 6000});
  Show();
  const int before = Inside().width;

  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));

  EXPECT_LT(Inside().width, before);
  EXPECT_EQ(Width(0) + Width(1) + Width(2), Inside().width);
  EXPECT_FALSE(::GetWindowLongW(Inner(list), GWL_STYLE) & WS_HSCROLL);
}

TEST_F(TableWindow, Only_whole_rows_are_shown_whatever_the_height_and_the_letters) {
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));
  Show();

  for (const int points : {7, 9, 11})
    for (int height = 3990; height < 4500; height += 45) {
      list.TextFont = Font{points, false, false};
      list.Move(0, 0, 6000, height);
      RECT window{};
      ::GetWindowRect(View().Window(), &window);
      const int shown = static_cast<int>(window.bottom - window.top);
      EXPECT_EQ((Inside().height - HeaderHeight()) % RowHeight(), 0) << points << " " << height;
      EXPECT_LE(shown, height / 15);
      EXPECT_GT(shown, height / 15 - RowHeight());
    }
}

TEST_F(TableWindow, Texts_are_read_without_harmful_signs_and_an_icon_alone_by_its_key) {
  list.SmallIcons = &icons;
  icons.Add(Picture::Of({1, 1, {0xFFFF0000}}), {}, u"ico_check");
  ListRow& row = list.Add(u"key", u"evil\u202Etxt.exe", 0);
  row.AddCell({}, Text(), 1);

  Show();

  EXPECT_EQ(Shown(0, 0), u"evil\uFFFDtxt.exe");
  EXPECT_EQ(Shown(0, 1), u"ico_check");
}

TEST_F(TableWindow, A_header_is_read_by_its_caption_or_by_what_stands_for_its_icon) {
  list.AddColumn({u"", 1500, Alignment::Centre, 1, u"העלאה"});
  Show();

  wchar_t name[64] = {};
  HDITEMW item{};
  item.mask = HDI_TEXT;
  item.pszText = name;
  item.cchTextMax = 64;
  ::SendMessageW(View().Header(), HDM_GETITEMW, 2, reinterpret_cast<LPARAM>(&item));

  EXPECT_EQ(winapi::TextOf(name), u"העלאה");
}

TEST_F(TableWindow, A_list_that_goes_before_its_view_leaves_an_empty_window) {
  auto other = std::make_unique<ListView>(form, u"other");
  other->AddColumn({u"one", 1500});
  other->Add(u"k", u"row", 0);
  Show();
  const HWND window = Inner(*other);

  other.reset();
  ::UpdateWindow(window);

  EXPECT_EQ(::SendMessageW(window, LVM_GETITEMCOUNT, 0, 0), 0);
}

} // namespace quendra::forms::win32
