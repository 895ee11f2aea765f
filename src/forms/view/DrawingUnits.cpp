#include "forms/view/DrawingUnits.h"

#include "forms/Form.h"
#include "forms/view/ControlPlacement.h"

#include <algorithm>

namespace quendra::forms {

namespace {

/// Pixels that text keeps off the right edge, which it would touch else.
constexpr int kEdge = 8;

} // namespace

Area DrawingUnits::FilledBox(int x1, int y1, int x2, int y2) const {
  const Spot first{PixelsX(std::min(x1, x2)), PixelsY(std::min(y1, y2))};
  const Spot last{PixelsX(std::max(x1, x2)), PixelsY(std::max(y1, y2))};
  return {first, {last.left - first.left + 1, last.top - first.top + 1}};
}

Area DrawingUnits::PrintedLine(int lineHeight) const {
  const int start = PixelsX(box_.CurrentX);
  const int top = PixelsY(box_.CurrentY);
  const int width = ExtentOf(box_.Position(), screen_).width;
  if (DirectionOf(box_.OwnerForm()) == Direction::RightToLeft)
    return {{0, top}, {width - start - kEdge, lineHeight}};
  return {{start, top}, {width - start, lineHeight}};
}

} // namespace quendra::forms
