#include "platform/windows/net/HostEntry.h"

#include <cstring>

namespace quendra::platform::windows {

std::vector<Ipv4Address> AddressesOf(const hostent& entry) {
  std::vector<Ipv4Address> addresses;
  std::uint32_t inMemory = 0;
  if (entry.h_addrtype != AF_INET || entry.h_length != sizeof inMemory || entry.h_addr_list == nullptr)
    return addresses;
  for (char** next = entry.h_addr_list; *next != nullptr; ++next) {
    std::memcpy(&inMemory, *next, sizeof inMemory);
    addresses.push_back(Ipv4Address::FromMemory(inMemory));
  }
  return addresses;
}

} // namespace quendra::platform::windows
