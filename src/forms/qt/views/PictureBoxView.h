#pragma once

#include "forms/qt/views/WidgetView.h"

#include <QImage>

namespace quendra::forms::qt {

/// A picture box: its ground colour, its picture stretched over it, and a surface with what was drawn on top
/// of both. The surface comes with the first drawing; a box that only shows its picture has none.
class PictureBoxView : public QWidget, public WidgetView {
 public:
  PictureBoxView(ViewContext& context, PictureBox& box, QWidget* parent);

  /// The box's size as it was laid out, in logical pixels. Drawings are made in this size, whatever size the
  /// form is shown in: what is measured, drawn and copied doesn't depend on the screen.
  QSize LaidOutSize() const;
  /// The drawings, see-through where nothing was drawn, in pixels of LaidOutSize by its device pixel ratio.
  QImage& Surface();
  void ClearSurface() { surface_ = {}; }
  /// Ground (when wanted), picture and drawings, in this order.
  enum class Ground { Drawn, SeeThrough };
  void PaintLayers(QPainter& painter, QSize size, Ground ground) const;

 protected:
  void Apply(Aspect aspect) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  const PictureBox& Box() const { return static_cast<const PictureBox&>(*TheControl()); }
  QSize SurfaceSize() const;

  QImage surface_;
};

} // namespace quendra::forms::qt
