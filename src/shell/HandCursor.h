#pragma once

#include "forms/WindowOperations.h"
#include "forms/controls/Control.h"

namespace quendra::shell {

/// The system's hand, shown while the mouse moves over a label that acts as a button.
class HandCursor {
 public:
  explicit HandCursor(forms::WindowOperations& windows) : windows_(windows) {}

  void Load() { handle_ = windows_.LoadCursor(kHand); }
  /// Nothing where the system has no such cursor.
  void Show() const {
    if (handle_ != forms::kNoCursor) windows_.SetCursor(handle_);
  }
  /// For every label in the container that acts as a button and does nothing else when the mouse moves over
  /// it.
  void ShowOverButtons(const forms::Container& container);
  forms::CursorHandle Handle() const { return handle_; }

 private:
  static constexpr int kHand = 32649;

  forms::WindowOperations& windows_;
  forms::CursorHandle handle_;
};

} // namespace quendra::shell
