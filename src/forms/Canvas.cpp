#include "forms/Canvas.h"

#include "forms/view/DrawingUnits.h"

namespace quendra::forms {

int Canvas::ScaleWidth(const PictureBox& box) const { return DrawingUnits(box, ScreenScale()).Width(); }

int Canvas::ScaleHeight(const PictureBox& box) const { return DrawingUnits(box, ScreenScale()).Height(); }

int Canvas::TextWidth(const PictureBox& box, TextView text) const {
  return DrawingUnits(box, ScreenScale()).UnitsX(WidthInPixels(box, text));
}

int Canvas::TextHeight(const PictureBox& box, TextView /*text*/) const {
  return DrawingUnits(box, ScreenScale()).UnitsY(LineHeightInPixels(box));
}

void Canvas::Cls(PictureBox& box) {
  DropDrawings(box);
  box.CurrentX = 0;
  box.CurrentY = 0;
}

void Canvas::Print(PictureBox& box, TextView text) {
  const DrawingUnits units(box, ScreenScale());
  const int height = LineHeightInPixels(box);
  PrintLine(box, text, units.PrintedLine(height));
  box.CurrentX = 0;
  box.CurrentY += units.UnitsY(height);
}

} // namespace quendra::forms
