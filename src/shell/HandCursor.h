#pragma once

#include "forms/Desktop.h"

namespace quendra::shell {

/// The system's hand, shown while the mouse moves over a label that acts as a button.
class HandCursor {
 public:
  explicit HandCursor(forms::Desktop& desktop) : desktop_(desktop) {}

  void Load() { handle_ = desktop_.LoadCursor(kHand); }
  /// Nothing where the system has no such cursor.
  void Show() const {
    if (handle_ != forms::kNoCursor) desktop_.SetCursor(handle_);
  }
  /// For every label in the container that acts as a button and does nothing else when the mouse moves over
  /// it.
  void ShowOverButtons(const forms::Container& container);
  forms::CursorHandle Handle() const { return handle_; }

 private:
  static constexpr int kHand = 32649;

  forms::Desktop& desktop_;
  forms::CursorHandle handle_;
};

} // namespace quendra::shell
