#pragma once

#include "forms/win32/views/PictureBoxView.h"

namespace quendra::forms::win32 {

/// The drawing operations on picture boxes, in the pixels of a form as it was laid out: a view that shows the
/// form smaller shows its drawings smaller. A box whose form isn't loaded has no surface; drawing on it does
/// nothing.
class Win32Drawing {
 public:
  /// `scale` is the screen's.
  Win32Drawing(const Scale& scale, Fonts& fonts) : scale_(scale), fonts_(fonts) {}

  int WidthInPixels(const PictureBox& box, TextView text) const;
  int LineHeight(const PictureBox& box) const;
  void DropDrawings(PictureBox& box);
  void FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour);
  void PrintLine(PictureBox& box, TextView text, const Area& place);
  void BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source, int sourceX,
              int sourceY);
  void Refresh(PictureBox& box);
  /// PNG alone: the icons of this system come as nothing else.
  bool DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                  int height);
  Picture ImageOf(const PictureBox& box) const;

 private:
  HFONT FontOf(const PictureBox& box) const { return fonts_.FontOf(box.TextFont(), scale_); }

  const Scale& scale_;
  Fonts& fonts_;
};

} // namespace quendra::forms::win32
