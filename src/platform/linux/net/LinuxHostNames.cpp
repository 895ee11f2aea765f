#include "platform/linux/net/LinuxHostNames.h"

#include "platform/linux/net/NameAnswer.h"
#include "platform/linux/net/NetworkInterfaces.h"
#include "platform/linux/net/SocketErrorNumbers.h"
#include "platform/net/SocketNumbers.h"

#include <strings.h>
#include <unistd.h>

#include <array>
#include <cerrno>

namespace quendra::platform::linux_ {

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
