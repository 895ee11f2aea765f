#include "forms/view/Palette.h"
#include "forms/win32/views/Clipboard.h"
#include "forms/win32/views/FieldWindowsFixture.h"

namespace quendra::forms::win32 {

namespace {

/// A text on the clipboard of the bed.
void PutOnClipboard(const Text& text) { win32::PutOnClipboard(nullptr, text); }

Text OnClipboard() {
  ::OpenClipboard(nullptr);
  const HANDLE memory = ::GetClipboardData(CF_UNICODETEXT);
  const Text text = memory ? Text(static_cast<const char16_t*>(::GlobalLock(memory))) : Text();
  if (memory) ::GlobalUnlock(memory);
  ::CloseClipboard();
  return text;
}

} // namespace

TEST_F(FieldWindows, Copy_is_a_command_that_the_handler_hears_of_by_its_control_character) {
  std::vector<int> pressed;
  line.KeyPress = [&](int& keyCode) { pressed.push_back(keyCode); };
  line.Value = u"text";
  Show();
  line.SelLength = 4;

  Key('C', kCtrl);

  EXPECT_EQ(pressed, std::vector<int>{3});
  EXPECT_EQ(OnClipboard(), u"text");
  EXPECT_EQ(line.Value(), u"text");
}

TEST_F(FieldWindows, A_refused_control_character_pastes_nothing) {
  PutOnClipboard(u"pasted");
  line.KeyPress = [](int& keyCode) { keyCode = 0; };
  Show();

  Key('V', kCtrl);
  EXPECT_EQ(line.Value(), u"");

  line.KeyPress = nullptr;
  Key('V', kCtrl);
  EXPECT_EQ(line.Value(), u"pasted");
}

TEST_F(FieldWindows, Harmful_signs_that_are_pasted_are_shown_and_kept_as_visible_ones) {
  PutOnClipboard(u"a\u202Eb");
  Show();

  Key('V', kCtrl);

  EXPECT_EQ(line.Value(), u"a\uFFFDb");
  EXPECT_EQ(Shown(line), u"a\uFFFDb");
  EXPECT_EQ(line.SelStart(), 3);
}

TEST_F(FieldWindows, A_control_character_that_comes_without_a_key_is_one_of_the_forms_keys_too) {
  std::vector<int> pressed;
  line.KeyPress = [&](int& keyCode) { pressed.push_back(keyCode); };
  form.Cancel = &label;
  Show();

  ::SendMessageW(Inner(line), WM_KEYDOWN, MAKEWPARAM(VK_PACKET, kEscapeKey), 0);
  ::SendMessageW(Inner(line), WM_CHAR, kEscapeKey, 0);

  EXPECT_TRUE(pressed.empty());
}

TEST_F(FieldWindows, Everything_is_selected_by_one_key) {
  line.Value = u"text";
  Show();

  Key('A', kCtrl);

  EXPECT_EQ(line.SelStart(), 0);
  EXPECT_EQ(line.SelLength(), 4);
}

TEST_F(FieldWindows, Ctrl_and_the_backspace_delete_a_word_and_the_handler_may_refuse_it) {
  line.Value = u"www.one.test";
  Show();
  line.SelStart = 12;

  Key(kBackspaceKey, kCtrl);
  EXPECT_EQ(line.Value(), u"www.one.");
  EXPECT_EQ(line.SelStart(), 8);

  std::vector<int> pressed;
  line.KeyPress = [&](int& keyCode) {
    pressed.push_back(keyCode);
    keyCode = 0;
  };
  Key(kBackspaceKey, kCtrl);
  EXPECT_EQ(line.Value(), u"www.one.");
  EXPECT_EQ(pressed, std::vector<int>{kBackspaceKey});

  line.KeyPress = nullptr;
  line.SelStart = 1;
  line.SelLength = 2;
  Key(kBackspaceKey, kCtrl);
  EXPECT_EQ(line.Value(), u"w.one.");

  line.ReadOnly = true;
  Key(kBackspaceKey, kCtrl);
  EXPECT_EQ(line.Value(), u"w.one.");
}

TEST_F(FieldWindows, Ctrl_and_the_backspace_tell_nothing_of_the_words_of_a_masked_text) {
  line.Masked = true;
  line.Value = u"two words";
  Show();
  line.SelStart = 9;

  Key(kBackspaceKey, kCtrl);

  EXPECT_EQ(line.Value(), u"");
}

TEST_F(FieldWindows, A_masked_field_keeps_its_text_to_itself_until_it_is_shown) {
  line.Masked = true;
  line.Value = u"secret";
  PutOnClipboard(u"before");
  Show();
  line.SelLength = 6;

  Key('C', kCtrl);
  Key(kEndKey);
  Key('9');

  EXPECT_EQ(line.Value(), u"secret9");
  EXPECT_EQ(OnClipboard(), u"before");
  EXPECT_TRUE(Style(line) & ES_PASSWORD);
  line.Masked = false;
  EXPECT_FALSE(Style(line) & ES_PASSWORD);
}

TEST_F(FieldWindows, Delete_and_the_arrows_are_no_key_presses) {
  int pressed = 0;
  line.KeyPress = [&](int&) { ++pressed; };
  line.Value = u"ab";
  Show();

  Key(kRightKey);
  EXPECT_EQ(line.SelStart(), 1);
  ::SendMessageW(Inner(line), WM_KEYDOWN, VK_DELETE, 0);

  EXPECT_EQ(line.Value(), u"a");
  EXPECT_EQ(pressed, 0);
}

TEST_F(FieldWindows, A_field_that_can_only_be_read_takes_no_text_back_from_its_handler) {
  int pressed = 0;
  line.ReadOnly = true;
  line.Value = u"fixed";
  line.KeyPress = [&](int&) { ++pressed; };
  Show();

  Key('A');

  EXPECT_EQ(pressed, 1);
  EXPECT_EQ(Shown(line), u"fixed");
  EXPECT_EQ(line.Value(), u"fixed");
}

TEST_F(FieldWindows, A_character_of_two_units_is_one_key_press) {
  std::vector<int> pressed;
  line.KeyPress = [&](int& keyCode) { pressed.push_back(keyCode); };
  Show();

  for (const WPARAM unit : {0xD83DU, 0xDE00U}) ::SendMessageW(Inner(line), WM_CHAR, unit, 0);

  EXPECT_EQ(pressed, std::vector<int>{0x1F600});
  EXPECT_EQ(line.Value(), u"\U0001F600");
}

TEST_F(FieldWindows, A_field_turns_to_the_direction_of_its_first_letter_and_keeps_caret_and_focus) {
  Show();
  EXPECT_FALSE(Style(line, GWL_EXSTYLE) & WS_EX_RTLREADING);

  line.Value = u"שלום, abc";
  line.SelStart = 3;
  Settle();

  EXPECT_TRUE(Style(line, GWL_EXSTYLE) & WS_EX_RTLREADING);
  EXPECT_TRUE(Style(line, GWL_EXSTYLE) & WS_EX_RIGHT);
  EXPECT_EQ(::GetFocus(), Inner(line));
  EXPECT_EQ(WindowWithCaret(), Inner(line));
  Key('X');
  EXPECT_EQ(line.Value(), u"שלוXם, abc");

  line.Value = u"10.0.0.1 שלום";
  Settle();
  EXPECT_TRUE(Style(line, GWL_EXSTYLE) & WS_EX_RTLREADING);
  line.Value = u"www.one.test";
  Settle();
  EXPECT_FALSE(Style(line, GWL_EXSTYLE) & WS_EX_RTLREADING);
}

TEST_F(FieldWindows, A_field_that_turns_tells_of_the_focus_no_second_time) {
  int came = 0;
  line.GotFocus = [&] { ++came; };
  Show();

  line.Value = u"שלום";
  Settle();

  EXPECT_EQ(came, 1);
}

TEST_F(FieldWindows, A_field_that_turns_while_another_form_is_active_has_the_focus_when_its_own_is_again) {
  TestForm other;
  Show();
  ASSERT_EQ(::GetFocus(), Inner(line));
  desktop.Show(other);
  Settle();
  ASSERT_NE(::GetFocus(), Inner(line));

  line.Value = u"שלום";
  Settle();
  ::SetActiveWindow(WindowOf(form).Top());
  Settle();

  EXPECT_TRUE(Style(line, GWL_EXSTYLE) & WS_EX_RTLREADING);
  EXPECT_EQ(::GetFocus(), Inner(line));
}

TEST_F(FieldWindows, A_field_turns_when_its_own_handlers_are_through) {
  Show();
  const HWND before = Inner(line);
  bool stood = false;
  line.KeyPress = [&](int& keyCode) {
    keyCode = 0;
    line.Value = u"שלום";
    desktop.PumpOnce();
    stood = ::IsWindow(before);
  };

  Key('A');
  EXPECT_TRUE(stood);
  Settle();

  EXPECT_TRUE(Style(line, GWL_EXSTYLE) & WS_EX_RTLREADING);
  EXPECT_EQ(line.Value(), u"שלום");
}

TEST_F(FieldWindows, A_report_follows_its_end_when_its_handler_says_so) {
  lines.Change = [this] { lines.SelStart = static_cast<int>(lines.Value().size()); };
  Show();
  for (int hop = 0; hop < 100; ++hop) lines.Value = lines.Value() + u"Hop #\t1\t<10 ms\t10.0.0.1\r\n";
  Settle();

  SCROLLINFO bar{sizeof bar, SIF_ALL, 0, 0, 0, 0, 0};
  ::GetScrollInfo(Inner(lines), SB_VERT, &bar);
  EXPECT_GT(bar.nPos, 50);
  EXPECT_EQ(bar.nPos, bar.nMax - static_cast<int>(bar.nPage) + 1);
  EXPECT_EQ(Shown(lines), lines.Value());
}

TEST_F(FieldWindows, Each_line_of_a_report_reads_in_its_own_direction) {
  lines.ReadOnly = true;
  lines.Value = u"מטפל...\r\ncalled (RAS)";
  Show();
  const auto leftOf = [this](std::size_t line, std::size_t sign) {
    const LRESULT mark = ::SendMessageW(Inner(lines), EM_LINEINDEX, line, 0);
    const std::size_t place = static_cast<std::size_t>(mark) + 1 + sign;
    return static_cast<short>(LOWORD(::SendMessageW(Inner(lines), EM_POSFROMCHAR, place, 0)));
  };

  EXPECT_LT(leftOf(0, 6), leftOf(0, 1));
  EXPECT_GT(leftOf(1, 11), leftOf(1, 1));
}

TEST_F(FieldWindows, What_is_copied_from_a_report_selected_and_read_in_it_knows_of_no_marks) {
  lines.ReadOnly = true;
  lines.Value = u"מטפל...\r\ncalled (RAS)";
  Show();
  Key(kTabKey);
  lines.SelStart = 9;
  lines.SelLength = 6;

  Key('C', kCtrl);
  EXPECT_EQ(OnClipboard(), u"called");
  Key('A', kCtrl);
  EXPECT_EQ(lines.SelStart(), 0);
  EXPECT_EQ(lines.SelLength(), 21);
  Key(kInsertKey, kCtrl);
  EXPECT_EQ(OnClipboard(), lines.Value());

  EXPECT_EQ(Shown(lines), lines.Value());
  lines.ReadOnly = false;
  Key(kEndKey, kCtrl);
  Key('X');
  EXPECT_EQ(lines.Value(), u"מטפל...\r\ncalled (RAS)X");
}

TEST_F(FieldWindows, A_report_has_letters_of_one_width_and_a_scroll_bar_inside_its_edge) {
  lines.Value = u"Trace\r\n";
  Show();

  const HDC device = ::GetDC(Inner(lines));
  const HGDIOBJ before =
      ::SelectObject(device, reinterpret_cast<HFONT>(::SendMessageW(Inner(lines), WM_GETFONT, 0, 0)));
  int narrow = 0;
  int wide = 0;
  ::GetCharWidth32W(device, L'i', L'i', &narrow);
  ::GetCharWidth32W(device, L'W', L'W', &wide);
  ::SelectObject(device, before);
  ::ReleaseDC(Inner(lines), device);

  EXPECT_EQ(narrow, wide);
  EXPECT_TRUE(Style(lines) & WS_VSCROLL);
  EXPECT_TRUE(Style(lines, GWL_EXSTYLE) & WS_EX_LEFTSCROLLBAR);
  lines.VerticalScrollBar = false;
  EXPECT_FALSE(Style(lines) & WS_VSCROLL);
}

TEST_F(FieldWindows, A_field_is_named_by_a_label_right_before_the_systems_window) {
  Show();

  const HWND before = ::GetWindow(Inner(line), GW_HWNDPREV);

  EXPECT_EQ(TextOfWindow(before), u"כתובת מעקב:");
  EXPECT_TRUE(::SendMessageW(before, WM_GETDLGCODE, 0, 0) & DLGC_STATIC);
  EXPECT_EQ(TextOfWindow(As<FieldView>(line).Window()), u"כתובת מעקב:");
}

TEST_F(FieldWindows, A_field_has_the_border_of_its_state) {
  Show();
  const HWND window = As<FieldView>(lines).Window();
  const HWND first = As<FieldView>(line).Window();

  EXPECT_EQ(PixelIn(window, 100, 0), Palette::StrongBorder);
  EXPECT_EQ(PixelIn(first, 100, 0), Palette::Focus);
  EXPECT_EQ(PixelIn(window, 100, 1), Palette::Page);
  lines.ReadOnly = true;
  EXPECT_EQ(PixelIn(window, 100, 1), Palette::QuietPage);
  EXPECT_EQ(PixelIn(window, 150, 50), Palette::QuietPage);
  lines.Enabled = false;
  EXPECT_EQ(PixelIn(window, 100, 0), Palette::Border);
}

} // namespace quendra::forms::win32
