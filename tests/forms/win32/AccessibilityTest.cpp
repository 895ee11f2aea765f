#include "forms/win32/Win32Fixture.h"
#include "forms/win32/WorkerFixture.h"

namespace quendra::forms::win32 {

/// What assistive technology, which asks windows by messages, sees of controls that we draw.
class AccessibilityOfWindows : public Win32Fixture {
 protected:
  /// The number of the system's class whose proxy speaks for the control's window; 0 for none.
  static LRESULT ClassOf(const Control& control) {
    return ::SendMessageW(ViewOf(control).Window(), WM_GETOBJECT, 0, OBJID_QUERYCLASSNAMEIDX);
  }
  /// As the proxy of a button does its default action.
  static void DoDefaultAction(const Control& control) {
    ::PostMessageW(ViewOf(control).Window(), BM_CLICK, 0, 0);
  }
  static constexpr LRESULT kButtonClass = 65536 + 2;
  static constexpr LRESULT kStaticClass = 65536 + 3;

  Label button{form, u"button"};
};

TEST_F(AccessibilityOfWindows, What_can_be_clicked_speaks_as_a_push_button_and_any_other_label_as_a_text) {
  Label text(form, u"text");
  Image picture(form, u"picture");
  Image ground(form, u"ground");
  button.Click = picture.Click = [] {};

  desktop.Load(form);

  EXPECT_EQ(ClassOf(button), kButtonClass);
  EXPECT_EQ(ClassOf(picture), kButtonClass);
  EXPECT_EQ(ClassOf(text), kStaticClass);
  EXPECT_EQ(ClassOf(ground), 0);
  EXPECT_EQ(ClassOf(form), 0);
}

TEST_F(AccessibilityOfWindows, A_press_by_assistive_technology_is_a_click) {
  int clicks = 0;
  button.Click = [&] { ++clicks; };
  desktop.Show(form);

  DoDefaultAction(button);
  desktop.PumpOnce();

  EXPECT_EQ(clicks, 1);
}

TEST_F(AccessibilityOfWindows, A_text_and_a_disabled_button_take_no_press) {
  int clicks = 0;
  Label text(form, u"text");
  text.MouseOnly = true;
  button.Click = text.Click = [&] { ++clicks; };
  desktop.Show(form);
  button.Enabled = false;

  DoDefaultAction(button);
  DoDefaultAction(text);
  desktop.PumpOnce();

  EXPECT_EQ(clicks, 0);
}

TEST_F(AccessibilityOfWindows, A_button_behind_a_modal_form_takes_no_press) {
  std::string pressed;
  TestForm dialog;
  Label ok(dialog, u"ok");
  button.Click = [&] { pressed += "covered "; };
  ok.Click = [&] {
    pressed += "ok";
    desktop.Unload(dialog);
  };
  desktop.Show(form);
  desktop.Post([&] {
    DoDefaultAction(button);
    DoDefaultAction(ok);
  });
  const auto limit = desktop.StartTimer(2000, [&] { desktop.End(-1); });

  EXPECT_NO_THROW(desktop.Show(dialog, Modality::Modal, &form));

  EXPECT_EQ(pressed, "ok");
}

TEST_F(AccessibilityOfWindows, A_press_that_opens_a_box_holds_nobody_who_sent_it) {
  SeenBox box;
  DWORD_PTR answer = 1;
  bool wentOn = false;
  bool boxStood = false;
  button.Click = [&] {
    const auto answers = desktop.StartTimer(1, [&] {
      if (!wentOn || std::exchange(boxStood, true)) return;
      user.AnswerBox(box);
    });
    desktop.MessageBox(u"text", 0, u"title");
  };
  desktop.Show(form);
  const HWND window = ViewOf(button).Window();
  const auto sends = [&] {
    ::SendMessageTimeoutW(window, BM_CLICK, 0, 0, SMTO_NORMAL, 3000, &answer);
    wentOn = true;
  };
  const Worker sender(sends);

  EXPECT_TRUE(user.WaitUntil([&] { return boxStood; }));

  EXPECT_EQ(box.count, 1);
  EXPECT_EQ(answer, 0U);
}

} // namespace quendra::forms::win32
