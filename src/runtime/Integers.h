#pragma once

#include "runtime/Fault.h"

#include <cstdint>
#include <limits>

namespace quendra {

/// A boolean of module state: 16 bits wide, true is -1.
using Boolean16 = std::int16_t;
inline constexpr Boolean16 kTrue16 = -1;
inline constexpr Boolean16 kFalse16 = 0;

/// A value in a field of type `Field`; one that doesn't fit raises fault 6.
template <typename Field> constexpr Field CheckedTo(std::int64_t value) {
  if (value < std::numeric_limits<Field>::min() || value > std::numeric_limits<Field>::max())
    throw Fault(Fault::kOverflow);
  return static_cast<Field>(value);
}

constexpr std::int16_t ToInt16(std::int64_t value) { return CheckedTo<std::int16_t>(value); }
constexpr std::int32_t ToInt32(std::int64_t value) { return CheckedTo<std::int32_t>(value); }

/// A double rounded to a whole number as the language does it, half to even; fault 6 when it doesn't fit.
std::int32_t RoundToInt32(double value);

/// A quotient as the language forms it: fault 11 for a divisor of 0, fault 6 for 0 by 0 and for what no
/// double holds.
double Quotient(double dividend, double divisor);

} // namespace quendra
