#include "platform/net/AddressList.h"

#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform {

namespace {

constexpr std::size_t kFieldBytes = sizeof(std::uint32_t);

} // namespace

void PutAddressList(std::span<std::uint8_t> buffer, std::span<const Ipv4Address> addresses) {
  if (buffer.size() < kFieldBytes) return;
  const std::size_t count = std::min(addresses.size(), buffer.size() / kFieldBytes - 1);
  PutLittle32(buffer, 0, static_cast<std::uint32_t>(count));
  std::size_t at = kFieldBytes;
  for (const Ipv4Address address : addresses.first(count)) {
    PutLittle32(buffer, at, address.InMemory());
    at += kFieldBytes;
  }
}

std::optional<Ipv4Address> FirstOfAddressList(std::span<const std::uint8_t> buffer) {
  if (buffer.size() < 2 * kFieldBytes || Little32(buffer, 0) == 0) return {};
  return Ipv4Address::FromMemory(Little32(buffer, kFieldBytes));
}

} // namespace quendra::platform
