#pragma once

#include "platform/net/Ipv4Address.h"

#include <span>

namespace quendra::platform {

/// What WSAAsyncGetHostByName leaves in its buffer: a count (32 bits, low byte first) and as many addresses,
/// as they lie in memory. Those that find no room are left out, and of a buffer without room for the count
/// nothing is touched.
void PutAddressList(std::span<std::uint8_t> buffer, std::span<const Ipv4Address> addresses);

/// The first address of such a buffer; nothing when it holds none.
std::optional<Ipv4Address> FirstOfAddressList(std::span<const std::uint8_t> buffer);

} // namespace quendra::platform
