#include "monitor/TcpOwnerEntry.h"

#include <algorithm>
#include <cstring>

namespace quendra::monitor {

namespace {

constexpr std::size_t kCountBytes = 4;

} // namespace

std::int32_t TcpEntryCount(const platform::IpHelper::TcpTable& table) {
  if (!table || table->size() < kCountBytes) return 0;
  std::uint32_t count = 0;
  std::memcpy(&count, table->data(), sizeof count);
  const std::size_t held = (table->size() - kCountBytes) / kTcpEntryBytes;
  return static_cast<std::int32_t>(std::min<std::size_t>(count, held));
}

TcpOwnerEntry TcpEntryAt(const platform::IpHelper::TcpTable& table, std::int32_t offset) {
  TcpOwnerEntry entry;
  static_assert(sizeof entry == kTcpEntryBytes);
  const std::size_t start = kCountBytes + static_cast<std::size_t>(offset);
  if (table && start + sizeof entry <= table->size())
    std::memcpy(&entry, table->data() + start, sizeof entry);
  return entry;
}

} // namespace quendra::monitor
