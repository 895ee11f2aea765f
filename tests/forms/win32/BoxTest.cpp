#include "forms/win32/Win32Fixture.h"

#include "forms/win32/boxes/BoxViews.h"

namespace quendra::forms::win32 {

namespace {

/// A window of the program that shows no form, and is the active one.
class OtherWindow {
 public:
  OtherWindow()
      : window_(::CreateWindowExW(0, L"STATIC", L"", WS_POPUP | WS_VISIBLE, 0, 0, 50, 50, nullptr, nullptr,
                                  nullptr, nullptr)) {
    ::SetForegroundWindow(window_);
  }
  ~OtherWindow() { ::DestroyWindow(window_); }
  OtherWindow(const OtherWindow&) = delete;
  OtherWindow& operator=(const OtherWindow&) = delete;

 private:
  HWND window_;
};

/// Hears of the alerts that the program's boxes raise.
class AlertListener {
 public:
  AlertListener()
      : hook_(::SetWinEventHook(EVENT_SYSTEM_ALERT, EVENT_SYSTEM_ALERT, nullptr, Hear,
                                ::GetCurrentProcessId(), 0, WINEVENT_OUTOFCONTEXT)) {
    count = 0;
  }
  ~AlertListener() { ::UnhookWinEvent(hook_); }
  AlertListener(const AlertListener&) = delete;
  AlertListener& operator=(const AlertListener&) = delete;

  static inline int count = 0; ///< the system hands nothing over that would tell one listener from another

 private:
  static void CALLBACK Hear(HWINEVENTHOOK, DWORD, HWND window, LONG, LONG, DWORD, DWORD) noexcept {
    if (FormWindow::Around(window)) ++count;
  }
  HWINEVENTHOOK hook_;
};

} // namespace

/// How message boxes lie on the screen, whatever their text, and what keys do in them.
class Boxes : public Win32Fixture {
 protected:
  struct Seen {
    Area box{};
    Area button{};
    bool buttonHasFocus = false;
    bool isScrolled = false;
    Text text{}; ///< of the field that scrolls it
  };

  /// Shows a box, looks at it and answers it by its first button.
  Seen Show(const Text& text, int flags = kInformation | kHebrewBox) {
    Seen seen;
    const auto looks = desktop.StartTimer(1, [&] {
      if (FormWindow* box = BoxAnswers::Standing()) Look(*box, seen);
    });
    SeenBox answered;
    desktop.Post([&] { desktop.Post([&] { user.AnswerBox(answered); }); });
    desktop.MessageBox(text, flags, u"title");
    return seen;
  }
  bool IsOnScreen(const Seen& seen) {
    const Area screen = UsableScreenRound(nullptr);
    return CommonPart(seen.box, screen) == seen.box && CommonPart(seen.button, seen.box) == seen.button &&
           seen.button.extent.height > 0;
  }
  /// Presses a key in the next box.
  void PressInBox(WORD key) {
    desktop.Post([=, this] {
      // Once the box stands.
      INPUT inputs[2]{};
      inputs[0].type = inputs[1].type = INPUT_KEYBOARD;
      inputs[0].ki.wVk = inputs[1].ki.wVk = key;
      inputs[1].ki.dwFlags = KEYEVENTF_KEYUP;
      if (!BoxAnswers::Standing()) return PressInBox(key);
      ::SendInput(2, inputs, sizeof(INPUT));
    });
  }

 private:
  static Area OnScreen(HWND window) {
    RECT place{};
    ::GetWindowRect(window, &place);
    return {{static_cast<int>(place.left), static_cast<int>(place.top)},
            {static_cast<int>(place.right - place.left), static_cast<int>(place.bottom - place.top)}};
  }
  static void Look(FormWindow& box, Seen& seen) {
    seen.box = box.OnScreen();
    for (const Control* control : box.TheForm()->Children()) {
      const auto& view = dynamic_cast<const WindowView&>(*control->View());
      if (const auto* field = dynamic_cast<const TextBox*>(control); field && field->Visible()) {
        seen.isScrolled = true;
        seen.text = field->Value();
      }
      if (!dynamic_cast<const CommandButton*>(control)) continue;
      seen.button = OnScreen(view.Window());
      seen.buttonHasFocus = view.HasFocus();
    }
  }
};

TEST_F(Boxes, Show_a_short_text_whole) {
  const Seen seen = Show(u"נתוני IP:\r\n1: 10.0.0.5\r\n2: 10.0.0.138\r\n3: 127.0.0.1");

  EXPECT_FALSE(seen.isScrolled);
  EXPECT_TRUE(IsOnScreen(seen));
}

TEST_F(Boxes, Keep_their_button_on_the_screen_under_4096_line_ends) {
  const Seen seen = Show(Text(4096, u'\n'));

  EXPECT_TRUE(IsOnScreen(seen));
  EXPECT_TRUE(seen.isScrolled);
}

TEST_F(Boxes, Keep_their_button_on_the_screen_under_one_long_line_without_blanks) {
  const Seen seen = Show(Text(4096, u'W'));

  EXPECT_TRUE(IsOnScreen(seen));
  EXPECT_TRUE(seen.isScrolled);
}

TEST_F(Boxes, Keep_their_button_on_the_screen_under_one_long_line_with_blanks) {
  Text words;
  while (words.size() < 4000) words += u"מילה ";

  EXPECT_TRUE(IsOnScreen(Show(words)));
}

TEST_F(Boxes, Hold_the_whole_text_in_the_field_that_scrolls_it) {
  Text lines;
  for (int line = 0; line < 200; ++line) lines += DecimalText(line) + u"\r\n";

  const Seen seen = Show(lines + u"end", kExclamation);

  EXPECT_EQ(seen.text, lines + u"end");
}

TEST_F(Boxes, Give_the_focus_to_their_button_and_not_to_the_text) {
  EXPECT_TRUE(Show(u"text").buttonHasFocus);
  EXPECT_TRUE(Show(Text(500, u'\n')).buttonHasFocus);
}

TEST_F(Boxes, Are_answered_by_Enter) {
  PressInBox(VK_RETURN);

  EXPECT_EQ(desktop.MessageBox(u"text", kYesNo | kHebrewBox, u"title"), 6);
}

TEST_F(Boxes, Are_answered_by_Escape_where_they_have_one_button) {
  PressInBox(VK_ESCAPE);

  EXPECT_EQ(desktop.MessageBox(u"text", kInformation, u"title"), 1);
}

TEST_F(Boxes, That_ask_stand_until_one_of_their_buttons_is_pressed) {
  bool stoodOn = false;
  SeenBox seen;
  PressInBox(VK_ESCAPE);
  const auto later = desktop.StartTimer(100, [&] {
    FormWindow* const box = BoxAnswers::Standing();
    if (!box || std::exchange(stoodOn, true)) return;
    ::SendMessageW(box->Top(), WM_SYSCOMMAND, SC_CLOSE, 0);
    user.AnswerBox(seen, 7);
  });

  EXPECT_EQ(desktop.MessageBox(u"text", kYesNo | kHebrewBox, u"title"), 7);
  EXPECT_TRUE(stoodOn);
}

TEST_F(Boxes, Keep_the_user_from_the_form_below_and_give_it_back) {
  bool blocked = false;
  SeenBox seen;
  desktop.Show(form);
  desktop.Post([&] {
    blocked = !::IsWindowEnabled(WindowOf(form).Top());
    user.AnswerBox(seen);
  });

  desktop.MessageBox(u"text", 0, u"title");

  EXPECT_TRUE(blocked);
  EXPECT_TRUE(::IsWindowEnabled(WindowOf(form).Top()));
}

TEST_F(Boxes, Whose_own_handler_fails_give_the_answer_of_their_default_button) {
  desktop.Post([&] {
    desktop.Post([&] {
      for (Control* control : BoxAnswers::Standing()->TheForm()->Children())
        if (dynamic_cast<CommandButton*>(control)) control->Click = [] { throw Fault(Fault::kOutOfMemory); };
      PressInBox(VK_RETURN);
    });
  });
  const auto limit = desktop.StartTimer(3000, [&] { desktop.End(-1); });

  EXPECT_EQ(desktop.MessageBox(u"text", kYesNo | kHebrewBox, u"title"), 6);
}

TEST_F(Boxes, Of_a_minimised_program_come_up_in_the_middle_of_the_screen) {
  desktop.Show(form);
  ::ShowWindow(WindowOf(form).Top(), SW_SHOWMINIMIZED);

  const Seen seen = Show(u"text");

  const Area screen = UsableScreenRound(nullptr);
  EXPECT_LE(std::abs(seen.box.corner.left + seen.box.Right() - screen.corner.left - screen.Right()), 2);
  EXPECT_LE(std::abs(seen.box.corner.top + seen.box.Bottom() - screen.corner.top - screen.Bottom()), 2);
}

TEST_F(Boxes, Belong_to_the_form_that_the_user_is_not_kept_from_when_none_is_active) {
  TestForm modal;
  HWND owner = nullptr;
  desktop.Show(form);
  desktop.Post([&] {
    const OtherWindow active;
    const auto looks = desktop.StartTimer(1, [&] {
      if (const FormWindow* box = BoxAnswers::Standing()) owner = ::GetWindow(box->Top(), GW_OWNER);
    });
    SeenBox seen;
    desktop.Post([&] { desktop.Post([&] { user.AnswerBox(seen); }); });
    desktop.MessageBox(u"text", 0, u"title");
    modal.Visible = false;
  });

  desktop.Show(modal, Modality::Modal, &form);

  EXPECT_EQ(owner, WindowOf(modal).Top());
}

TEST_F(Boxes, Tell_assistive_technology_that_they_come_up) {
  AlertListener alerts;

  Show(u"text");

  EXPECT_EQ(alerts.count, 1);
}

using Lines = std::vector<BoxLine>;

TEST(BoxLines, Read_as_their_marks_of_direction_say_and_are_drawn_without_them) {
  BoxContent content = BoxContentOf(u"שלום\r\nC:\\a\r\n1: 10.0.0.5", kHebrewBox, u"");

  EXPECT_EQ(LinesOf(content), (Lines{{u"שלום", Direction::RightToLeft},
                                     {u"C:\\a", Direction::LeftToRight},
                                     {u"1: 10.0.0.5", Direction::RightToLeft}}));
}

TEST(BoxLines, Of_a_box_without_marks_read_as_their_letters_do) {
  BoxContent content = BoxContentOf(u"text\n\nשלום", 0, u"");

  EXPECT_EQ(LinesOf(content), (Lines{{u"text", Direction::LeftToRight},
                                     {u"", Direction::LeftToRight},
                                     {u"שלום", Direction::RightToLeft}}));
}

} // namespace quendra::forms::win32
