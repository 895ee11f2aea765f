#pragma once

#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

class ImageView : public QWidget, public WidgetView {
 public:
  ImageView(ViewContext& context, Image& image, QWidget* parent);

 protected:
  void paintEvent(QPaintEvent* event) override;
};

/// Draws a picture over the whole rectangle.
void DrawStretched(QPainter& painter, const QRect& rectangle, const QPixmap& pixmap);

} // namespace quendra::forms::qt
