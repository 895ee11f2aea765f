#include "platform/windows/net/OwnerTable.h"

#include "platform/net/TcpTableEntry.h"

#include <algorithm>

namespace quendra::platform::windows {

std::vector<std::uint8_t> CleanOwnerTable(std::span<const std::uint8_t> table) {
  constexpr std::size_t kFirst = TcpTableEntry::kFirstOffset;
  const bool hasCount = table.size() >= kFirst;
  const std::size_t room = hasCount ? (table.size() - kFirst) / TcpTableEntry::kBytes : 0;
  const std::size_t count = hasCount ? std::min<std::size_t>(Little32(table, 0), room) : 0;
  std::vector<std::uint8_t> clean(kFirst + count * TcpTableEntry::kBytes);
  PutLittle32(clean, 0, static_cast<std::uint32_t>(count));
  for (std::size_t at = kFirst; at < clean.size(); at += TcpTableEntry::kBytes) {
    TcpTableEntry entry = TcpTableEntry::ReadFrom(table, at);
    entry.localPort &= 0xFFFF;
    entry.remotePort = entry.state == kTcpListening ? 0 : entry.remotePort & 0xFFFF;
    entry.WriteTo(clean, at);
  }
  return clean;
}

} // namespace quendra::platform::windows
