#include "platform/linux/capture/InterfaceQuestions.h"

#include <cstring>
#include <linux/ethtool.h>
#include <linux/sockios.h>
#include <net/if.h>
#include <sys/ioctl.h>
#include <sys/socket.h>

namespace quendra::platform::linux_ {

namespace {

ifreq RequestFor(const std::string& name) {
  ifreq request{};
  name.copy(request.ifr_name, IFNAMSIZ - 1);
  return request;
}

} // namespace

InterfaceQuestions::InterfaceQuestions() : socket_(::socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0)) {}

bool InterfaceQuestions::IsUp(const std::string& name) const {
  ifreq request = RequestFor(name);
  return ::ioctl(socket_.Number(), SIOCGIFFLAGS, &request) == 0 && (request.ifr_flags & IFF_UP) != 0;
}

std::optional<unsigned> InterfaceQuestions::HardwareType(const std::string& name) const {
  ifreq request = RequestFor(name);
  if (::ioctl(socket_.Number(), SIOCGIFHWADDR, &request) != 0) return std::nullopt;
  return request.ifr_hwaddr.sa_family;
}

std::string InterfaceQuestions::DriverName(const std::string& name) const {
  ethtool_drvinfo info{};
  info.cmd = ETHTOOL_GDRVINFO;
  ifreq request = RequestFor(name);
  request.ifr_data = reinterpret_cast<char*>(&info);
  if (::ioctl(socket_.Number(), SIOCETHTOOL, &request) != 0) return {};
  return {info.driver, ::strnlen(info.driver, sizeof info.driver)};
}

} // namespace quendra::platform::linux_
