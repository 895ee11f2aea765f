#include "platform/linux/LinuxHostNames.h"

#include "platform/linux/NetworkInterfaces.h"

#include <netdb.h>
#include <netinet/in.h>
#include <strings.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <memory>

namespace quendra::platform::linux_ {

namespace {

std::optional<std::vector<std::uint32_t>> LookUp(const std::string& name) {
  addrinfo hints{};
  hints.ai_family = AF_INET;
  hints.ai_socktype = SOCK_STREAM;
  addrinfo* first = nullptr;
  if (::getaddrinfo(name.c_str(), nullptr, &hints, &first) != 0) return {};
  const std::unique_ptr<addrinfo, void (*)(addrinfo*)> owner(first, ::freeaddrinfo);
  std::vector<std::uint32_t> addresses;
  for (const addrinfo* entry = first; entry != nullptr; entry = entry->ai_next)
    addresses.push_back(reinterpret_cast<const sockaddr_in*>(entry->ai_addr)->sin_addr.s_addr);
  return addresses;
}

} // namespace

std::optional<std::string> LinuxHostNames::gethostname() {
  std::array<char, 256> name{};
  if (::gethostname(name.data(), name.size() - 1) != 0) return {};
  return std::string(name.data());
}

std::optional<std::vector<std::uint32_t>> LinuxHostNames::gethostbyname(const std::string& name) {
  const auto own = gethostname();
  if (!name.empty() && (!own || ::strcasecmp(name.c_str(), own->c_str()) != 0)) return LookUp(name);
  auto addresses = HostAddressOrder(ReadNetworkInterfaces(folder_));
  if (addresses.empty()) return {};
  return addresses;
}

} // namespace quendra::platform::linux_
