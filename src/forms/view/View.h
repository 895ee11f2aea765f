#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// A view that lasts no longer than its form's window and lets go of its control before.
class View : public ControlView {
 public:
  /// Lets go of the control; what shows it may live on for a while without it.
  virtual void Release() = 0;
};

} // namespace quendra::forms
