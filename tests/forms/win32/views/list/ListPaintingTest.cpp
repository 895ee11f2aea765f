#include "forms/win32/views/list/TableWindowFixture.h"

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

} // namespace quendra::forms::win32
