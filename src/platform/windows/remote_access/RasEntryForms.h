#pragma once

#include "platform/windows/remote_access/RasLayouts.h"

#include <vector>

namespace quendra::platform::windows {

/// The system's form of a RASENTRY and of the alternate numbers behind it. Numbers that lie outside the image
/// are none: the system would look for them there.
std::vector<std::uint8_t> WideEntryOf(std::span<const std::uint8_t> entry);
/// The program's form, in a record of so many bytes.
std::vector<std::uint8_t> NarrowEntryOf(std::span<const std::uint8_t> wide, std::uint32_t recordBytes);

} // namespace quendra::platform::windows
