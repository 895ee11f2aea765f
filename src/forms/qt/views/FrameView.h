#pragma once

#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

class FrameView : public QWidget, public WidgetView {
 public:
  FrameView(ViewContext& context, Frame& frame, QWidget* parent);
  QAccessible::Role Role() const override { return QAccessible::Grouping; }

 protected:
  void Apply(Aspect aspect) override;
  QString AccessibleName() const override;
  void paintEvent(QPaintEvent* event) override;

 private:
  const Frame& TheFrame() const { return static_cast<const Frame&>(*TheControl()); }
};

/// Places the views of a container's controls anew: mirrored ones hang on its width.
void PlaceChildren(const Container& container);

} // namespace quendra::forms::qt
