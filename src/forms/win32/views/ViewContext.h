#pragma once

#include "forms/Desktop.h"
#include "forms/loop/Dispatcher.h"
#include "forms/loop/TimerView.h"
#include "forms/view/ActiveForm.h"
#include "forms/view/Scale.h"
#include "forms/win32/drawing/Fonts.h"
#include "forms/win32/drawing/PictureStore.h"

namespace quendra::forms::win32 {

class MouseInput;

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
};

} // namespace quendra::forms::win32
