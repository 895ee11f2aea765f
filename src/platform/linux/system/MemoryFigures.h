#pragma once

#include "platform/system/MemoryStatus.h"

#include <cstdint>
#include <string_view>

namespace quendra::platform::linux_ {

/// The memory of a machine whose kernel tells `meminfo` of it, for a program that holds so many bytes. Free
/// is what can be had without swapping, the page file is memory and swap together, and the address space has
/// 2 GB. No figure is above 2,147,483,647, and an available one never 0: the program divides by it.
MemoryStatus MemoryStatusOf(std::string_view meminfo, std::uint64_t ownBytes);

} // namespace quendra::platform::linux_
