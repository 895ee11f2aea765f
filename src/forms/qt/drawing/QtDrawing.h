#pragma once

#include "forms/qt/views/PictureBoxView.h"

namespace quendra::forms::qt {

/// The drawing operations on picture boxes, in the pixels of a form as it was laid out: a view that shows the
/// form smaller shows its drawings smaller. A box whose form isn't loaded has no surface; drawing on it does
/// nothing.
class QtDrawing {
 public:
  explicit QtDrawing(const Scale& scale) : scale_(scale) {}

  int WidthInPixels(const PictureBox& box, TextView text) const;
  int LineHeight(const PictureBox& box) const;
  void DropDrawings(PictureBox& box);
  void FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour);
  void PrintLine(PictureBox& box, TextView text, const Area& place);
  void BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source, int sourceX,
              int sourceY);
  void Refresh(PictureBox& box);
  bool DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                  int height);
  Picture ImageOf(const PictureBox& box) const;

 private:
  const Scale& scale_;
};

} // namespace quendra::forms::qt
