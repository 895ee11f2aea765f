#pragma once

#include "forms/controls/PictureBox.h"
#include "forms/view/paint/Raster.h"
#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

/// A picture box: its ground colour, its picture stretched over it, and a surface with what was drawn on top
/// of both. The surface comes with the first drawing; a box that only shows its picture has none.
class PictureBoxView : public WindowView {
 public:
  PictureBoxView(ViewContext& context, PictureBox& box, HWND parent);

  void Paint(Drawing& drawing) override;

  /// The box's size as it was laid out, a pixel at least. Drawings are made in this size, whatever size the
  /// form is shown in: what is measured, drawn and copied doesn't depend on the screen.
  Extent LaidOutSize() const;
  /// The drawings, see-through where nothing was drawn.
  Bitmap& Drawings();
  void ClearDrawings() { drawings_ = {}; }
  /// Ground (when wanted), picture and drawings, in this order, in the size as laid out.
  Bitmap Layers(Ground ground) const;

 protected:
  void Apply(Aspect aspect) override;

 private:
  const PictureBox& Box() const { return static_cast<const PictureBox&>(*TheControl()); }

  Bitmap drawings_;
};

} // namespace quendra::forms::win32
