#include "forms/view/ControlPlacement.h"

#include "forms/Form.h"

#include <algorithm>
#include <cstdlib>

namespace quendra::forms {

Direction DirectionOf(const Form& form) {
  return form.RightToLeft ? Direction::RightToLeft : Direction::LeftToRight;
}

Direction PlacingOf(const Control& control) {
  const Container* holder = control.Parent();
  return holder && holder->PlacesFromLeft ? Direction::LeftToRight : DirectionOf(control.OwnerForm());
}

Area PlaceOf(const Geometry& control, int container, const Scale& scale, Direction direction) {
  const Extent extent = ExtentOf(control, scale);
  int left = scale.PixelsX(control.left);
  if (direction == Direction::RightToLeft)
    left = scale.PixelsX(container) - scale.PixelsX(control.left + control.width);
  return {{left, scale.PixelsY(control.top)}, extent};
}

Extent ExtentOf(const Geometry& control, const Scale& scale) {
  // Rules stay in sight in a form that is shown smaller.
  const auto atLeast = [](int twips) { return twips > 0 ? 1 : 0; };
  return {std::max(atLeast(control.width),
                   scale.PixelsX(control.left + control.width) - scale.PixelsX(control.left)),
          std::max(atLeast(control.height),
                   scale.PixelsY(control.top + control.height) - scale.PixelsY(control.top))};
}

Spot TwipsAt(double left, double top, int width, const Scale& scale, Direction direction) {
  const double fromLeading = direction == Direction::RightToLeft ? width - left : left;
  return {scale.TwipsX(fromLeading), scale.TwipsY(top)};
}

Side SideOf(Alignment alignment, Direction direction) {
  if (alignment == Alignment::Centre) return Side::Middle;
  return (alignment == Alignment::Leading) == (direction == Direction::RightToLeft) ? Side::Right
                                                                                    : Side::Left;
}

Area AlignedIn(Side side, Extent extent, Area room) {
  int left = room.corner.left;
  if (side == Side::Right) left += room.extent.width - extent.width;
  if (side == Side::Middle) left += room.extent.width / 2 - extent.width / 2;
  return {{left, room.corner.top + room.extent.height / 2 - extent.height / 2}, extent};
}

Geometry BoundsOf(const LineEnds& ends) {
  return {std::min(ends.x1, ends.x2), std::min(ends.y1, ends.y2), std::abs(ends.x2 - ends.x1),
          std::abs(ends.y2 - ends.y1)};
}

Stroke StrokeOf(const LineEnds& ends, Direction direction) {
  if (ends.x1 == ends.x2 || ends.y1 == ends.y2) return Stroke::Straight;
  const bool fallsAsTold = (ends.x1 < ends.x2) == (ends.y1 < ends.y2);
  return fallsAsTold == (direction == Direction::LeftToRight) ? Stroke::Falling : Stroke::Rising;
}

int StrokeRoom(int borderWidth) { return std::clamp(borderWidth, 1, 32); }

} // namespace quendra::forms
