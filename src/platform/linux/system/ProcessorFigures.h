#pragma once

#include "platform/system/PerformanceBlock.h"

#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// The idle times of the kernel's processors in units of 100 ns, as its "stat" tells them in ticks: one after
/// the other under the names "0", "1" and so on, without gaps where one is switched off, then all of them as
/// "_Total". Waiting for a disk counts as idle. Lines that aren't understood are left out.
std::vector<ProcessorTimes> ProcessorsOf(std::string_view stat, std::uint64_t ticksPerSecond);

} // namespace quendra::platform::linux_
