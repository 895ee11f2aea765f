#include "platform/linux/net/NetworkInterfaces.h"

#include <ifaddrs.h>
#include <net/if.h>
#include <netinet/in.h>

#include <algorithm>
#include <memory>

namespace quendra::platform::linux_ {

namespace {

NetworkInterface& InterfaceNamed(std::vector<NetworkInterface>& interfaces, const std::string& name) {
  for (auto& interface : interfaces)
    if (interface.name == name) return interface;
  interfaces.push_back({name, false, false, {}, {}, 0});
  return interfaces.back();
}

void AddAddresses(std::vector<NetworkInterface>& interfaces) {
  ifaddrs* first = nullptr;
  if (::getifaddrs(&first) != 0) return;
  const std::unique_ptr<ifaddrs, void (*)(ifaddrs*)> owner(first, ::freeifaddrs);
  for (const ifaddrs* entry = first; entry != nullptr; entry = entry->ifa_next) {
    if (entry->ifa_addr == nullptr || entry->ifa_addr->sa_family != AF_INET ||
        (entry->ifa_flags & IFF_UP) == 0)
      continue;
    // An address with a label of its own names it after a colon.
    const std::string_view label(entry->ifa_name);
    NetworkInterface& interface = InterfaceNamed(interfaces, std::string(label.substr(0, label.find(':'))));
    interface.isLoopback = (entry->ifa_flags & IFF_LOOPBACK) != 0;
    interface.addresses.push_back(
        Ipv4Address::FromMemory(reinterpret_cast<const sockaddr_in*>(entry->ifa_addr)->sin_addr.s_addr));
  }
}

} // namespace

std::vector<NetworkInterface> ReadNetworkInterfaces(const ProcFolder& folder) {
  std::vector<NetworkInterface> interfaces;
  AddAddresses(interfaces);
  for (const auto& route : ReadDefaultRoutes(folder)) {
    const auto found = std::find_if(interfaces.begin(), interfaces.end(),
                                    [&](const auto& interface) { return interface.name == route.interface; });
    if (found == interfaces.end()) continue;
    if (!found->hasDefaultRoute) found->metric = route.metric;
    found->hasDefaultRoute = true;
    if (!route.gateway.IsAny()) found->gateways.push_back(route.gateway);
  }
  return interfaces;
}

std::vector<Ipv4Address> HostAddressOrder(std::vector<NetworkInterface> interfaces) {
  const auto rank = [](const NetworkInterface& interface) {
    if (interface.isLoopback) return std::uint64_t{0};
    if (!interface.hasDefaultRoute) return std::uint64_t{1};
    return (std::uint64_t{1} << 32) + UINT32_MAX - interface.metric;
  };
  std::stable_sort(interfaces.begin(), interfaces.end(),
                   [&](const auto& left, const auto& right) { return rank(left) < rank(right); });
  std::vector<Ipv4Address> addresses;
  for (const auto& interface : interfaces)
    addresses.insert(addresses.end(), interface.addresses.rbegin(), interface.addresses.rend());
  return addresses;
}

} // namespace quendra::platform::linux_
