#pragma once

#include "forms/Canvas.h"
#include "forms/FormHost.h"
#include "forms/MessageLoop.h"
#include "forms/MessageWindows.h"
#include "forms/WindowOperations.h"
#include "forms/controls/Controls.h"

namespace quendra::forms {

/// What the program's logic sees of the desktop that shows its forms. One thread. Logic that needs one side
/// of it takes that side.
class Desktop : public FormHost, public MessageLoop, public Canvas, public WindowOperations {
 public:
  /// The windows that exist for their messages alone.
  MessageWindows Windows;
};

} // namespace quendra::forms
