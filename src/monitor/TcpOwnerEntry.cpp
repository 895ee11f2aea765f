#include "monitor/TcpOwnerEntry.h"

#include <algorithm>

namespace quendra::monitor {

std::int32_t TcpEntryCount(const platform::IpHelper::TcpTable& table) {
  if (!table || table->size() < TcpOwnerEntry::kFirstOffset) return 0;
  const std::size_t held = (table->size() - TcpOwnerEntry::kFirstOffset) / TcpOwnerEntry::kBytes;
  return static_cast<std::int32_t>(std::min<std::size_t>(Little32(*table, 0), held));
}

TcpOwnerEntry TcpEntryAt(const platform::IpHelper::TcpTable& table, std::int32_t offset) {
  const std::size_t start = TcpOwnerEntry::kFirstOffset + static_cast<std::size_t>(offset);
  if (!table || start + TcpOwnerEntry::kBytes > table->size()) return {};
  return {platform::TcpTableEntry::ReadFrom(*table, start)};
}

} // namespace quendra::monitor
