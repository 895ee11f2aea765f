#pragma once

#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

/// A view and, for all kinds but timers, the widget that it is; the parent owns the widget, the caller a bare
/// view.
struct MadeView {
  View* view = nullptr;
  QWidget* widget = nullptr;
};

/// The view of a control by its kind; none for kinds that nobody sees, such as a list of images.
MadeView MakeView(ViewContext& context, Control& control, QWidget& parent);

} // namespace quendra::forms::qt
