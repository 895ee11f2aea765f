#pragma once

#include "forms/Desktop.h"
#include "forms/view/BoxContent.h"
#include "platform/EventLoop.h"

#include <functional>
#include <memory>

namespace quendra::forms {

/// A message box as its user saw it.
struct SeenBox {
  BoxContent content;
  int count = 0; ///< boxes that were answered into this
};

/// A desktop under test with somebody in front of it: what a user does and sees.
class DesktopDriver {
 public:
  virtual ~DesktopDriver() = default;

  virtual Desktop& TheDesktop() = 0;
  virtual platform::EventLoop& Loop() = 0;

  /// Runs a program from its first handler until it has ended and gives its status; -1 when it doesn't end
  /// within a bounded time.
  virtual int Run(std::function<void()> start) = 0;
  /// Handles events and lets time pass until the condition holds; false when it doesn't within a bounded
  /// time.
  virtual bool WaitUntil(const std::function<bool()>& condition) = 0;

  virtual void Click(Control& control) = 0;
  /// Presses and releases a key while the form is the active one: the code of its character or that of a
  /// NamedKey, and a sum of ShiftState.
  virtual void PressKey(Form& form, int keyCode, int shift = kNoShift) = 0;
  virtual void PressCloseBox(Form& form) = 0;
  /// Answers the message box that stands, or the next one as soon as it does, by the button of this number.
  virtual void AnswerBox(SeenBox& seen, int button = 1) = 0;

  /// Whether the form can be seen on the screen.
  virtual bool Stands(Form& form) = 0;
  /// The control of the active form that has the focus, nullptr for none.
  virtual const Control* Focused(Form& form) = 0;
};

/// Makes a desktop and its user.
using DriverFactory = std::unique_ptr<DesktopDriver> (*)();

} // namespace quendra::forms
