#pragma once

#include "forms/controls/PictureBox.h"
#include "forms/view/Area.h"
#include "forms/view/Scale.h"

namespace quendra::forms {

/// Drawing on picture boxes. All numbers are in the unit of the box's ScaleMode.
class Canvas {
 public:
  virtual ~Canvas() = default;

  int ScaleWidth(const PictureBox& box) const;
  int ScaleHeight(const PictureBox& box) const;
  int TextWidth(const PictureBox& box, TextView text) const;
  int TextHeight(const PictureBox& box, TextView text) const;
  /// Leaves the box as it is without drawings and goes to its start.
  void Cls(PictureBox& box);
  /// A filled box with both corners in it.
  virtual void FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) = 0;
  /// Prints at CurrentX and CurrentY in ForeColour and moves to the start of the next line. A box of a form
  /// that reads from right to left prints from its right edge.
  void Print(PictureBox& box, TextView text);
  /// Copies in pixels, as SRCCOPY does.
  virtual void BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source,
                      int sourceX, int sourceY) = 0;
  /// Shows what was drawn.
  virtual void Refresh(PictureBox& box) = 0;
  /// Draws an icon's image, in any format that desktops know (PNG, SVG or XPM bytes), scaled to width by
  /// height. False when the bytes are no image; nothing is drawn then.
  virtual bool DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                          int height) = 0;
  /// What the box holds now, drawings included.
  virtual Picture ImageOf(const PictureBox& box) const = 0;

 protected:
  /// The scale of the screen, in which a form is laid out.
  virtual const Scale& ScreenScale() const = 0;
  /// Pixels that the text takes on one line.
  virtual int WidthInPixels(const PictureBox& box, TextView text) const = 0;
  /// Pixels from one line to the next.
  virtual int LineHeightInPixels(const PictureBox& box) const = 0;
  virtual void DropDrawings(PictureBox& box) = 0;
  /// `place` is in pixels, and the text starts at its leading edge.
  virtual void PrintLine(PictureBox& box, TextView text, const Area& place) = 0;
};

} // namespace quendra::forms
