#pragma once

#include <array>
#include <cstdint>
#include <span>

namespace quendra::platform {

/// A moment as the published 16-byte image: year, month from 1, day of the week from 0 for Sunday, day, hour,
/// minute, second and millisecond, 16 bits each, in universal time.
using SystemTimeImage = std::array<std::uint8_t, 16>;

/// Hundreds of nanoseconds since the start of 1601. False, and nothing written, for a moment that is none.
bool FileTimeOf(std::span<const std::uint8_t, 16> systemTime, std::uint64_t& fileTime);
/// What lies below a millisecond is cut off.
SystemTimeImage SystemTimeOf(std::uint64_t fileTime);

} // namespace quendra::platform
