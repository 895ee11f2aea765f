#pragma once

#include "forms/view/Area.h"

#include <vector>

namespace quendra::forms {

/// The parts of a picture that are to be drawn anew. Those that lie near to each other become one, so that
/// they stay few.
class DueAreas {
 public:
  void Add(Area area);
  /// Those that have a part in an area, whole; they are due no more.
  std::vector<Area> TakeThoseIn(Area part);

 private:
  std::vector<Area> areas_;
};

} // namespace quendra::forms
