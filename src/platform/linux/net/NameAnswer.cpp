#include "platform/linux/net/NameAnswer.h"

#include "platform/linux/net/SocketErrorNumbers.h"

#include <netdb.h>
#include <netinet/in.h>
#include <sys/socket.h>

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

} // namespace quendra::platform::linux_
