#pragma once

#include "forms/Desktop.h"
#include "forms/loop/Dispatcher.h"
#include "forms/loop/TimerView.h"
#include "forms/view/ActiveForm.h"
#include "forms/view/Scale.h"
#include "forms/win32/drawing/Fonts.h"
#include "forms/win32/drawing/FormPicture.h"
#include "forms/win32/drawing/PictureStore.h"
#include "forms/win32/views/HoverTip.h"

#include <cstdint>

namespace quendra::forms::win32 {

class MouseInput;

/// How the user works in a form, and what it shows.
struct FormState {
  /// The last thing that the user took in hand was the keyboard.
  bool usesKeys = false;
  /// The focus moves with the form's window: it comes back to where it was.
  bool focusComesBack = false;
  /// Made so far; each gets a number of its own.
  std::uintptr_t windows = 0;
  FormPicture picture{};
  HoverTip tip{};
};

/// What every view of a desktop needs of it.
struct ViewContext {
  Desktop& desktop;
  Dispatcher& dispatcher;
  /// That of the form; without a form, that of the screen.
  const Scale& scale;
  PictureStore& pictures;
  Fonts& fonts;
  MouseInput& mouse;
  const TimerStarter& startTimer;
  ActiveForm& active;
  FormState& state;
};

} // namespace quendra::forms::win32
