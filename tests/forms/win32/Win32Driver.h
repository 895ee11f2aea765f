#pragma once

#include "forms/suite/DesktopDriver.h"
#include "forms/win32/Win32Desktop.h"

#include <vector>

namespace quendra::forms::win32 {

/// Waits for message boxes and answers them as they come, also when no handler of the program runs any more.
class BoxAnswers {
 public:
  BoxAnswers();
  ~BoxAnswers();
  BoxAnswers(const BoxAnswers&) = delete;
  BoxAnswers& operator=(const BoxAnswers&) = delete;

  void Expect(SeenBox& seen, int button);
  /// The box that stands in front; nullptr for none.
  static FormWindow* Standing();

 private:
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;
  void Look();

  struct Awaited {
    SeenBox* seen;
    int button;
  };
  HWND window_;
  std::vector<Awaited> awaited_;
};

/// The user of a desktop on the screen of the bed.
class Win32Driver : public DesktopDriver {
 public:
  Desktop& TheDesktop() override { return desktop_; }
  platform::EventLoop& Loop() override { return desktop_; }
  Win32Desktop& Win32() { return desktop_; }

  int Run(std::function<void()> start) override;
  bool WaitUntil(const std::function<bool()>& condition) override;
  void Click(Control& control) override;
  void PressKey(Form& form, int keyCode, int shift = kNoShift) override;
  void PressCloseBox(Form& form) override;
  void AnswerBox(SeenBox& seen, int button = 1) override { answers_.Expect(seen, button); }
  bool Stands(Form& form) override;
  const Control* Focused(Form& form) override;

  /// The form's own; nullptr for one that isn't loaded.
  static FormWindow* WindowOf(const Form& form) { return dynamic_cast<FormWindow*>(form.View()); }

 private:
  /// Handles what has come.
  void Pump();

  Win32Desktop desktop_;
  BoxAnswers answers_;
};

/// A press and a release of the left button in the middle of a control, as messages of its window.
void ClickWindow(HWND window);

} // namespace quendra::forms::win32
