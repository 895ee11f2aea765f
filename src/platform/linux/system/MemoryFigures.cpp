#include "platform/linux/system/MemoryFigures.h"

#include "platform/linux/system/Files.h"

#include <algorithm>
#include <charconv>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint64_t kMost = 0x7FFFFFFF;

/// The bytes of a line such as "MemTotal:  16384 kB"; 0 where there is none.
std::uint64_t BytesOf(std::string_view meminfo, std::string_view name) {
  for (const std::string& line : Split(meminfo, '\n')) {
    const auto words = Split(line, ' ');
    std::uint64_t kilobytes = 0;
    if (words.size() < 2 || words[0] != name) continue;
    const char* const end = words[1].data() + words[1].size();
    if (std::from_chars(words[1].data(), end, kilobytes).ptr != end) return 0;
    return std::min(kilobytes, UINT64_MAX / 4096) * 1024;
  }
  return 0;
}

} // namespace

MemoryStatus MemoryStatusOf(std::string_view meminfo, std::uint64_t ownBytes) {
  const std::uint64_t total = BytesOf(meminfo, "MemTotal:");
  const std::uint64_t available = std::min(BytesOf(meminfo, "MemAvailable:"), total);
  MemoryStatus status;
  const auto set = [&](MemoryStatus::Field field, std::uint64_t bytes) {
    status.Set(field, static_cast<std::uint32_t>(std::min(bytes, kMost)));
  };
  set(MemoryStatus::kLength, MemoryStatus::kBytes);
  set(MemoryStatus::kMemoryLoad,
      total == 0 ? 0 : (total - available) / std::max<std::uint64_t>(total / 100, 1));
  set(MemoryStatus::kTotalPhys, total);
  set(MemoryStatus::kAvailPhys, available);
  set(MemoryStatus::kTotalPageFile, total + BytesOf(meminfo, "SwapTotal:"));
  set(MemoryStatus::kAvailPageFile, std::max<std::uint64_t>(available + BytesOf(meminfo, "SwapFree:"), 1));
  set(MemoryStatus::kTotalVirtual, kMost);
  set(MemoryStatus::kAvailVirtual, kMost - std::min(ownBytes, kMost - 1));
  return status;
}

} // namespace quendra::platform::linux_
