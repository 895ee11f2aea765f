#pragma once

#include <cstdint>
#include <span>
#include <vector>

namespace quendra::platform::windows {

/// The system's table of connections with their owners in the form that the program reads: the entries that
/// are there, whatever the count says; ports without what the system leaves beside them, and none for the far
/// end of a socket that listens.
std::vector<std::uint8_t> CleanOwnerTable(std::span<const std::uint8_t> table);

} // namespace quendra::platform::windows
