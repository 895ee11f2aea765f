#pragma once

#include "forms/WindowProcedures.h"

namespace quendra::forms {

/// Windows of a desktop. Beside those of its forms, some that nobody sees: they exist to receive messages.
class MessageWindows : public WindowProcedures {
 public:
  /// The new window's handle, kNoWindow on failure. Its procedure answers 0 to everything.
  virtual WindowHandle Create();
  /// False for a handle that is no window.
  virtual bool Destroy(WindowHandle window) { return Remove(window); }
};

} // namespace quendra::forms
