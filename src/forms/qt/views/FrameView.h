#pragma once

#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

class FrameView : public QWidget, public WidgetView {
 public:
  FrameView(ViewContext& context, Frame& frame, QWidget* parent);

 protected:
  void Apply(Aspect aspect) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  void PaintTitle(QPainter& painter, const Text& title) const;
  const Frame& TheFrame() const { return static_cast<const Frame&>(*TheControl()); }
};

/// Places the views of a container's controls anew: mirrored ones hang on its width.
void PlaceChildren(const Container& container);

} // namespace quendra::forms::qt
