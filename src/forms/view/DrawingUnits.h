#pragma once

#include "forms/controls/PictureBox.h"
#include "forms/view/Area.h"
#include "forms/view/Scale.h"

namespace quendra::forms {

/// Converts between pixels and the unit that a picture box draws in: its ScaleMode's. Drawings are made in
/// the pixels of a form as it was laid out, whatever size it is shown in.
class DrawingUnits {
 public:
  /// `screen` is the scale of the screen, of no form.
  DrawingUnits(const PictureBox& box, const Scale& screen) : box_(box), screen_(screen) {}

  int PixelsX(int units) const { return CountsPixels() ? units : screen_.PixelsX(units); }
  int PixelsY(int units) const { return CountsPixels() ? units : screen_.PixelsY(units); }
  int UnitsX(int pixels) const { return CountsPixels() ? pixels : screen_.TwipsX(pixels); }
  int UnitsY(int pixels) const { return CountsPixels() ? pixels : screen_.TwipsY(pixels); }

  /// The box's own size in its unit.
  int Width() const { return FromTwips(box_.Position().width, screen_.PixelsX(box_.Position().width)); }
  int Height() const { return FromTwips(box_.Position().height, screen_.PixelsY(box_.Position().height)); }

  /// Pixels of a filled box between two corners in any order, both of them in it.
  Area FilledBox(int x1, int y1, int x2, int y2) const;
  /// Where a line of this height in pixels is printed: from CurrentX and CurrentY to the edge. A form that
  /// reads from right to left is printed on from the right edge, with a little distance to it.
  Area PrintedLine(int lineHeight) const;

 private:
  bool CountsPixels() const { return box_.ScaleMode == ScaleMode::Pixels; }
  int FromTwips(int twips, int pixels) const { return CountsPixels() ? pixels : twips; }

  const PictureBox& box_;
  const Scale& screen_;
};

} // namespace quendra::forms
