#include "platform/linux/net/NetworkInterfaces.h"

#include "platform/linux/system/Files.h"

#include <ifaddrs.h>
#include <net/if.h>
#include <netinet/in.h>

#include <algorithm>
#include <charconv>
#include <memory>
#include <optional>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint32_t kRouteUp = 0x0001;
constexpr std::uint32_t kRouteHasGateway = 0x0002;
constexpr std::uint32_t kRouteRejects = 0x0200;

std::optional<std::uint32_t> Number(std::string_view text, int base) {
  std::uint32_t value = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, base);
  if (error != std::errc() || end != text.data() + text.size()) return {};
  return value;
}

/// Columns: interface, destination, gateway, flags, references, uses, metric, mask.
std::optional<DefaultRoute> ParseRoute(const std::string& line) {
  std::vector<std::string> columns;
  for (const auto& part : Split(line, '\t')) columns.push_back(part.substr(0, part.find(' ')));
  if (columns.size() < 8) return {};
  const auto destination = Number(columns[1], 16), gateway = Number(columns[2], 16),
             flags = Number(columns[3], 16);
  const auto metric = Number(columns[6], 10), mask = Number(columns[7], 16);
  if (destination != 0u || mask != 0u || !gateway || !flags || !metric) return {};
  if ((*flags & kRouteUp) == 0 || (*flags & kRouteRejects) != 0) return {};
  return DefaultRoute{columns[0], Ipv4Address::FromMemory((*flags & kRouteHasGateway) != 0 ? *gateway : 0),
                      *metric};
}

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
    // An address with a label of its own names it behind a colon.
    const std::string_view label(entry->ifa_name);
    NetworkInterface& interface = InterfaceNamed(interfaces, std::string(label.substr(0, label.find(':'))));
    interface.isLoopback = (entry->ifa_flags & IFF_LOOPBACK) != 0;
    interface.addresses.push_back(
        Ipv4Address::FromMemory(reinterpret_cast<const sockaddr_in*>(entry->ifa_addr)->sin_addr.s_addr));
  }
}

} // namespace

std::vector<DefaultRoute> ParseDefaultRoutes(std::string_view text) {
  std::vector<DefaultRoute> routes;
  for (const auto& line : Split(text, '\n'))
    if (auto route = ParseRoute(line)) routes.push_back(std::move(*route));
  std::stable_sort(routes.begin(), routes.end(), [](const DefaultRoute& left, const DefaultRoute& right) {
    return left.metric < right.metric;
  });
  return routes;
}

std::vector<NetworkInterface> ReadNetworkInterfaces(const ProcFolder& folder) {
  std::vector<NetworkInterface> interfaces;
  AddAddresses(interfaces);
  for (const auto& route : ParseDefaultRoutes(folder.File("thread-self/net/route").value_or(""))) {
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
