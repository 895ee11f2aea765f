#pragma once

#include <cstdint>
#include <functional>

namespace quendra::platform::linux_ {

/// Milliseconds of a clock that never goes back.
using Clock = std::function<std::uint64_t()>;

/// The system's cheapest clock; it moves in steps of a few milliseconds.
std::uint64_t CoarseMilliseconds();

} // namespace quendra::platform::linux_
