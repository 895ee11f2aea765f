#include "forms/view/paint/DueAreas.h"

#include "forms/view/paint/Raster.h"

#include <algorithm>
#include <cstdint>
#include <iterator>

namespace quendra::forms {

namespace {

constexpr std::size_t kMost = 12;

bool IsEmpty(const Area& area) { return area.extent.width <= 0 || area.extent.height <= 0; }

std::int64_t SizeOf(const Area& area) { return std::int64_t{area.extent.width} * area.extent.height; }

Area Around(const Area& one, const Area& other) {
  const Spot corner{std::min(one.corner.left, other.corner.left), std::min(one.corner.top, other.corner.top)};
  return {corner,
          {std::max(one.Right(), other.Right()) - corner.left,
           std::max(one.Bottom(), other.Bottom()) - corner.top}};
}

/// Whether drawing both at once takes little more than drawing one after the other.
bool AreNear(const Area& one, const Area& other) {
  return 2 * SizeOf(Around(one, other)) <= 3 * (SizeOf(one) + SizeOf(other));
}

} // namespace

void DueAreas::Add(Area area) {
  if (IsEmpty(area)) return;
  // What has grown may have come near to others.
  for (bool grown = true; grown;) {
    const auto near = std::find_if(areas_.begin(), areas_.end(), [&](const Area& other) {
      return areas_.size() >= kMost || AreNear(area, other);
    });
    grown = near != areas_.end();
    if (!grown) continue;
    area = Around(area, *near);
    areas_.erase(near);
  }
  areas_.push_back(area);
}

std::vector<Area> DueAreas::TakeThoseIn(Area part) {
  const auto taken = std::stable_partition(areas_.begin(), areas_.end(),
                                           [&](const Area& area) { return IsEmpty(CommonPart(area, part)); });
  std::vector<Area> due(taken, areas_.end());
  areas_.erase(taken, areas_.end());
  return due;
}

} // namespace quendra::forms
