#pragma once

#include "runtime/Variant.h"

namespace quendra::capture {

/// Adds bytes to a running total in kilobytes; an empty total counts as 0. A text that holds no number is
/// fault 13.
inline void AddBytes(Variant& total, std::int32_t bytes) {
  const double kilobytes = bytes / 1024.0;
  if (double* number = total.NumberInPlace())
    *number += kilobytes;
  else
    total = (total.IsEmpty() ? 0.0 : total.Number()) + kilobytes;
}

} // namespace quendra::capture
