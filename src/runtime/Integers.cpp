#include "runtime/Integers.h"

#include <cmath>

namespace quendra {

std::int32_t RoundToInt32(double value) {
  if (!(value >= -2147483648.5 && value < 2147483647.5)) throw Fault(Fault::kOverflow);
  return static_cast<std::int32_t>(std::nearbyint(value));
}

double Quotient(double dividend, double divisor) {
  if (divisor == 0) throw Fault(dividend == 0 ? Fault::kOverflow : Fault::kDivision);
  const double quotient = dividend / divisor;
  if (!std::isfinite(quotient)) throw Fault(Fault::kOverflow);
  return quotient;
}

} // namespace quendra
