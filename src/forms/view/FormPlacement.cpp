#include "forms/view/FormPlacement.h"

#include <algorithm>

namespace quendra::forms {

namespace {

/// How much of a length there is room for, 1 at most.
double Share(int room, int length) { return length <= room ? 1 : static_cast<double>(room) / length; }

} // namespace

Fitting FittingScale(Extent form, Extent room) {
  const double scale = std::min(Share(room.width, form.width), Share(room.height, form.height));
  return {std::max(scale, kLeastScale), scale < kLeastScale};
}

Extent WindowExtent(Extent shown, Extent room, int scrollBar) {
  bool wide = shown.width > room.width;
  const bool high = shown.height + (wide ? scrollBar : 0) > room.height;
  wide = shown.width + (high ? scrollBar : 0) > room.width;
  return {std::min(room.width, shown.width + (high ? scrollBar : 0)),
          std::min(room.height, shown.height + (wide ? scrollBar : 0))};
}

Spot CornerOver(Extent window, Area over, Area screen) {
  const Spot middle{over.corner.left + (over.extent.width - window.width) / 2,
                    over.corner.top + (over.extent.height - window.height) / 2};
  return CornerOnScreen({middle, window}, screen);
}

Spot CornerOnScreen(Area window, Area screen) {
  const int lastLeft = screen.corner.left + screen.extent.width - window.extent.width;
  const int lastTop = screen.corner.top + screen.extent.height - window.extent.height;
  return {std::max(screen.corner.left, std::min(window.corner.left, lastLeft)),
          std::max(screen.corner.top, std::min(window.corner.top, lastTop))};
}

} // namespace quendra::forms
