#pragma once

#include "forms/win32/views/WindowView.h"

#include <memory>

namespace quendra::forms::win32 {

/// A view and, for all kinds but timers, the window view that it is.
struct MadeView {
  std::unique_ptr<View> view{};
  WindowView* window = nullptr;
};

/// The view of a control by its kind; none for kinds that nobody sees, such as a list of images.
MadeView MakeView(ViewContext& context, Control& control, HWND parent);

} // namespace quendra::forms::win32
