#include "platform/net/InterfaceRow.h"

#include "platform/net/IpHelper.h"

#include <algorithm>

namespace quendra::platform {

std::uint32_t PutInterfaceTable(std::span<const InterfaceRow> rows, std::span<std::uint8_t> buffer,
                                std::uint32_t& size) {
  const std::size_t needed = InterfaceRow::kFirstOffset + rows.size() * InterfaceRow::kBytes;
  const bool fits = size >= needed && buffer.size() >= needed;
  size = static_cast<std::uint32_t>(needed);
  if (!fits) return IpHelper::kErrorInsufficientBuffer;
  PutLittle32(buffer, 0, static_cast<std::uint32_t>(rows.size()));
  auto at = buffer.begin() + InterfaceRow::kFirstOffset;
  for (const InterfaceRow& row : rows) at = std::ranges::copy(row.bytes, at).out;
  return 0;
}

} // namespace quendra::platform
