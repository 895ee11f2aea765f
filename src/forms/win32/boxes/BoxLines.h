#pragma once

#include "forms/view/BoxContent.h"
#include "forms/view/Direction.h"

namespace quendra::forms::win32 {

/// A line of a box as it is drawn: what its marks of direction say, and the text without them.
struct BoxLine {
  Text text{};
  Direction direction = Direction::LeftToRight;
  friend bool operator==(const BoxLine&, const BoxLine&) = default;
};

/// The system's letters of XP's time know no isolates and would show them.
std::vector<BoxLine> LinesOf(const BoxContent& content);

} // namespace quendra::forms::win32
