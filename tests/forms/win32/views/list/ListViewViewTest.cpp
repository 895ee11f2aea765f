#include "forms/win32/views/list/ListViewView.h"
#include "forms/view/ListLook.h"
#include "forms/win32/views/ViewFixture.h"

#include <commctrl.h>

namespace quendra::forms::win32 {

/// Looks at a part of a window again and again, while the window's own thread draws.
class Watcher {
 public:
  Watcher(HWND window, Area part)
      : window_(window), part_(part), seen_(part.extent),
        thread_(::CreateThread(nullptr, 0, Run, this, 0, nullptr)) {}
  ~Watcher() { End(); }
  Watcher(const Watcher&) = delete;
  Watcher& operator=(const Watcher&) = delete;

  void End() {
    if (!thread_) return;
    ::InterlockedExchange(&over_, 1);
    ::WaitForSingleObject(thread_, INFINITE);
    ::CloseHandle(std::exchange(thread_, nullptr));
  }
  int Looks() const { return looks_; }
  /// How often it had one colour.
  int Blanks() const { return blanks_; }

 private:
  static DWORD WINAPI Run(void* watcher) noexcept {
    auto& self = *static_cast<Watcher*>(watcher);
    while (!self.over_) self.Look();
    return 0;
  }
  void Look() {
    const HDC device = ::GetDC(window_);
    ::SetLayout(device, 0);
    const auto [width, height] = part_.extent;
    ::BitBlt(seen_.Dc(), 0, 0, width, height, device, part_.corner.left, part_.corner.top, SRCCOPY);
    ::ReleaseDC(window_, device);
    const auto pixels = seen_.Pixels();
    ++looks_;
    if (std::equal(pixels.begin() + 1, pixels.end(), pixels.begin())) ++blanks_;
  }

  HWND window_;
  Area part_;
  Surface seen_;
  LONG volatile over_ = 0;
  int looks_ = 0;
  int blanks_ = 0;
  HANDLE thread_;
};

class TableWindow : public ViewFixture {
 protected:
  TableWindow() {
    form.design = [this] { list.Move(0, 0, 6000, 4500); };
    list.AddColumn({u"יישום", 1500});
    list.AddColumn({u"פורטים", 1500, Alignment::Trailing});
  }

  ListRow& AddRow(const Text& name) {
    ListRow& row = list.Add(u"p" + name, name, 0);
    row.AddCell(u".80.", {});
    return row;
  }
  ListViewView& View() { return As<ListViewView>(list); }
  LRESULT Ask(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) {
    Settle();
    return ::SendMessageW(Inner(list), message, wParam, lParam);
  }
  int Count() { return static_cast<int>(Ask(LVM_GETITEMCOUNT)); }
  int SelectedRow() { return static_cast<int>(Ask(LVM_GETNEXTITEM, static_cast<WPARAM>(-1), LVNI_SELECTED)); }
  int Width(int column) { return static_cast<int>(Ask(LVM_GETCOLUMNWIDTH, static_cast<WPARAM>(column))); }
  Text Shown(int row, int column) {
    wchar_t text[64] = {};
    LVITEMW item{};
    item.iSubItem = column;
    item.pszText = text;
    item.cchTextMax = 64;
    Ask(LVM_GETITEMTEXTW, static_cast<WPARAM>(row), reinterpret_cast<LPARAM>(&item));
    return winapi::TextOf(text);
  }
  Extent Inside() {
    Settle();
    return View().Inner().Inside();
  }
  int RowHeight() { return View().PlaceOfRow(0).extent.height; }
  int HeaderHeight() {
    RECT header{};
    ::GetWindowRect(View().Header(), &header);
    return static_cast<int>(header.bottom - header.top);
  }
  /// In the pixels of the system's window, whose own places count from the right.
  Spot MiddleOf(int row) { return {20, View().PlaceOfRow(row).corner.top + RowHeight() / 2}; }

  /// Handles what the view has posted to the system's window, and nothing else.
  void TellDue() {
    MSG message{};
    while (::PeekMessageW(&message, Inner(list), WM_APP, 0xBFFF, PM_REMOVE)) ::DispatchMessageW(&message);
  }
  /// Of the columns that are 100 pixels wide, counted from the right as the system's window does.
  bool IsDue(int row, int cell) {
    const HRGN region = ::CreateRectRgn(0, 0, 0, 0);
    ::GetUpdateRgn(Inner(list), region, FALSE);
    const int middle = View().PlaceOfRow(row).corner.top + RowHeight() / 2;
    const bool due = ::PtInRegion(region, 100 * cell + 50, middle) != 0;
    ::DeleteObject(region);
    return due;
  }
  RECT OnScreen() {
    RECT window{};
    ::GetWindowRect(Inner(list), &window);
    return window;
  }
  /// Pixels between the window's left or right edge and what rows have.
  LONG BarBeside(bool left) {
    const RECT window = OnScreen();
    RECT rows{};
    ::GetClientRect(Inner(list), &rows);
    ::MapWindowPoints(Inner(list), nullptr, reinterpret_cast<POINT*>(&rows), 2);
    return left ? rows.left - window.left : window.right - rows.right;
  }
  static bool IsGround(Colour colour) {
    return colour == RowGround(0, false) || colour == RowGround(1, false) || colour == RowGround(0, true);
  }

  ImageList icons{form, u"icons"};
  ListView list{form, u"main_ListView1"};
};

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

TEST_F(TableWindow, Rows_have_their_grounds_in_turns_and_the_selected_one_its_own) {
  for (const Text name : {u"1", u"2", u"3"}) AddRow(name);
  Show();
  list.Select(&list.Row(2));

  for (const int row : {0, 1, 2})
    EXPECT_EQ(PixelIn(Inner(list), 5, MiddleOf(row).top), RowGround(row, row == 1)) << row;
}

TEST_F(TableWindow, A_leading_cell_stands_at_the_right_edge_of_a_mirrored_form_and_is_no_mirror_image) {
  list.ClearColumns();
  list.AddColumn({u"", 5700});
  list.SmallIcons = &icons;
  icons.Add(Picture::Of({2, 2, {0xFFFF0000, 0xFF0000FF, 0xFFFF0000, 0xFF0000FF}}));
  list.Add(u"p1", u"", 1);
  Show();
  const int middle = MiddleOf(0).top;
  const int right = Inside().width;

  const auto isRed = [](Colour pixel) { return (pixel & 0xFF) > 150 && pixel >> 16 < 100; };
  const auto isBlue = [](Colour pixel) { return (pixel & 0xFF) < 100 && pixel >> 16 > 150; };
  EXPECT_TRUE(isRed(PixelIn(Inner(list), right - 8 - 17, middle)));
  EXPECT_TRUE(isBlue(PixelIn(Inner(list), right - 8 - 3, middle)));
}

TEST_F(TableWindow, The_bar_of_many_rows_stands_at_the_left_of_a_mirrored_list_and_takes_the_mouse) {
  for (const bool fromRight : {true, false}) {
    form.RightToLeft = fromRight;
    for (int i = list.Count(); i < 300; ++i) AddRow(DecimalText(1000 + i));
    Show();
    Settle();

    EXPECT_GT(BarBeside(fromRight), 0) << fromRight;
    EXPECT_EQ(BarBeside(!fromRight), 0) << fromRight;
    const RECT window = OnScreen();
    const LONG bar = fromRight ? window.left + 5 : window.right - 5;
    EXPECT_EQ(Ask(WM_NCHITTEST, 0, MAKELPARAM(bar, window.top + 100)), HTVSCROLL) << fromRight;
    desktop.Unload(form);
  }
}

TEST_F(TableWindow, No_part_of_a_mirrored_list_stays_undrawn_whatever_rows_and_size_it_has) {
  Show();
  for (const int rows : {0, 300, 3, 300, 0})
    for (const int width : {6000, 4500, 5250}) {
      list.Clear();
      list.Move(0, 0, width, 4500);
      for (int i = 0; i < rows; ++i) AddRow(DecimalText(1000 + i));
      Settle();
      Ask(LVM_SCROLL, 0, 100 * RowHeight());

      EXPECT_EQ(BarBeside(true) > 0, rows == 300) << rows;
      EXPECT_EQ(BarBeside(false), 0) << rows;
      const RECT window = OnScreen();
      for (const LONG left : {window.right - window.left - 1, BarBeside(true)})
        for (LONG top = HeaderHeight(); top < window.bottom - window.top; top += 5 * RowHeight())
          EXPECT_TRUE(IsGround(PixelIn(Inner(list), left, top + 1))) << rows << " " << left << " " << top;
    }
}

TEST_F(TableWindow, A_mirrored_list_that_scrolls_leaves_nothing_of_what_was_there) {
  Show();
  for (int i = 0; i < 300; ++i) AddRow(DecimalText(1000 + i));
  Settle();
  ::UpdateWindow(Inner(list));
  const auto onScreen = [this](int left, int line) {
    const HDC device = ::GetDC(Inner(list));
    ::SetLayout(device, 0);
    const Colour pixel = ::GetPixel(device, left, HeaderHeight() + line * RowHeight() + 2);
    ::ReleaseDC(Inner(list), device);
    return pixel;
  };
  ASSERT_EQ(onScreen(0, 0), RowGround(0, true));

  for (const int rows : {3, -1}) {
    ::SendMessageW(Inner(list), LVM_SCROLL, 0, rows * RowHeight());
    ::UpdateWindow(Inner(list));
    const int top = static_cast<int>(::SendMessageW(Inner(list), LVM_GETTOPINDEX, 0, 0));
    for (const int left : {0, Inside().width - 1})
      for (int line = 0; line < 5; ++line)
        EXPECT_EQ(onScreen(left, line), RowGround(top + line, false)) << rows << " " << left << " " << line;
  }
}

TEST_F(TableWindow, A_changed_cell_is_due_and_nothing_else) {
  Show();
  for (int i = 0; i < 10; ++i) AddRow(DecimalText(i));
  ::UpdateWindow(Inner(list));

  list.Row(3).SetCellText(1, u".443.");
  TellDue();

  RECT due{};
  EXPECT_TRUE(::GetUpdateRect(Inner(list), &due, FALSE));
  const Area row = View().PlaceOfRow(2);
  EXPECT_EQ(due.top, row.corner.top);
  EXPECT_EQ(due.bottom, row.Bottom());
  EXPECT_EQ(due.right - due.left, 100);
}

TEST_F(TableWindow, A_row_of_5000_that_changes_out_of_sight_is_not_drawn) {
  Show();
  for (int i = 0; i < 5000; ++i) AddRow(DecimalText(i));
  ::UpdateWindow(Inner(list));

  list.Row(4900).SetCellText(1, u".443.");
  TellDue();

  RECT due{};
  EXPECT_FALSE(::GetUpdateRect(Inner(list), &due, FALSE));
}

TEST_F(TableWindow, Hundreds_of_changes_of_a_handler_are_due_at_once_with_those_in_sight_alone) {
  Show();
  for (int i = 0; i < 300; ++i) AddRow(DecimalText(i));
  Settle();
  ::UpdateWindow(Inner(list));

  for (int row = 3; row <= 300; row += 2) list.Row(row).SetCellText(1, u".443.");
  EXPECT_FALSE(::GetUpdateRect(Inner(list), nullptr, FALSE));
  TellDue();

  EXPECT_FALSE(IsDue(0, 1));
  EXPECT_FALSE(IsDue(1, 1));
  EXPECT_TRUE(IsDue(2, 1));
  EXPECT_FALSE(IsDue(2, 0));
  EXPECT_FALSE(IsDue(3, 1));
  EXPECT_TRUE(IsDue(4, 1));
}

TEST_F(TableWindow, No_row_turns_blank_while_all_are_drawn_anew) {
  Show();
  for (int i = 0; i < 300; ++i) AddRow(DecimalText(1000 + i));
  Settle();
  ::UpdateWindow(Inner(list));

  Watcher watcher(Inner(list), View().PlaceOfRow(3));
  for (int pass = 0; pass < 60; ++pass) {
    for (int row = 1; row <= 300; ++row) list.Row(row).SetCellText(1, DecimalText(1000 + pass));
    TellDue();
    ::RedrawWindow(Inner(list), nullptr, nullptr, RDW_ERASE | RDW_INVALIDATE | RDW_UPDATENOW);
  }
  watcher.End();

  EXPECT_GT(watcher.Looks(), 60);
  EXPECT_EQ(watcher.Blanks(), 0);
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
