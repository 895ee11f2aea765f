#include "platform/linux/net/LinuxHostNames.h"

#include "platform/linux/net/NetworkInterfaces.h"
#include "platform/linux/net/SocketErrorNumbers.h"
#include "platform/net/Sockets.h"

#include <netdb.h>
#include <netinet/in.h>
#include <strings.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <memory>

namespace quendra::platform::linux_ {

NameAnswer LookUpName(const std::string& name) {
  addrinfo hints{};
  hints.ai_family = AF_INET;
  hints.ai_socktype = SOCK_STREAM;
  addrinfo* first = nullptr;
  NameAnswer answer;
  answer.error = LookUpErrorOf(::getaddrinfo(name.c_str(), nullptr, &hints, &first));
  if (answer.error != 0) return answer;
  const std::unique_ptr<addrinfo, void (*)(addrinfo*)> owner(first, ::freeaddrinfo);
  for (const addrinfo* entry = first; entry != nullptr; entry = entry->ai_next)
    answer.addresses.push_back(
        Ipv4Address::FromMemory(reinterpret_cast<const sockaddr_in*>(entry->ai_addr)->sin_addr.s_addr));
  return answer;
}

std::optional<std::string> LinuxHostNames::gethostname() {
  std::array<char, 256> name{};
  lastError_ = ::gethostname(name.data(), name.size() - 1) == 0 ? 0 : SocketErrorOf(errno);
  if (lastError_ != 0) return {};
  return std::string(name.data());
}

std::optional<std::vector<Ipv4Address>> LinuxHostNames::gethostbyname(const std::string& name) {
  const auto own = gethostname();
  const bool isOwn = name.empty() || (own && ::strcasecmp(name.c_str(), own->c_str()) == 0);
  NameAnswer answer =
      isOwn ? NameAnswer{0, HostAddressOrder(ReadNetworkInterfaces(folder_))} : LookUpName(name);
  if (answer.error == 0 && answer.addresses.empty()) answer.error = kHostNotFound;
  lastError_ = answer.error;
  if (lastError_ != 0) return {};
  return std::move(answer.addresses);
}

} // namespace quendra::platform::linux_
