#include "runtime/Integers.h"

#include <cmath>

namespace quendra {

std::int32_t RoundToInt32(double value) {
  if (!(value >= -2147483648.5 && value < 2147483647.5)) throw Fault(Fault::kOverflow);
  return static_cast<std::int32_t>(std::nearbyint(value));
}

} // namespace quendra
