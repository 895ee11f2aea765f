#include "platform/linux/adapters/CardAddresses.h"

#include "platform/adapters/AdapterNumbers.h"

#include <bit>
#include <optional>

namespace quendra::platform::linux_ {

namespace {

/// Nothing where a bit of the network follows one of the host.
std::optional<std::uint32_t> PrefixOf(const std::string& mask) {
  const auto address = Ipv4Address::FromText(std::string_view(mask));
  if (!address) return {};
  const auto prefix = static_cast<std::uint32_t>(std::countl_one(address->InHost()));
  const std::uint32_t rest = prefix == 32 ? 0 : address->InHost() << prefix;
  return rest == 0 && prefix > 0 ? std::optional(prefix) : std::nullopt;
}

/// Of a host: none of loopback, of no host, of many hosts.
std::optional<Ipv4Address> HostAddress(const std::string& text) {
  const auto address = Ipv4Address::FromText(std::string_view(text));
  if (!address) return {};
  const std::uint32_t first = address->InHost() >> 24;
  return first == 0 || first == 127 || first >= 224 ? std::nullopt : address;
}

} // namespace

std::uint32_t ReadCardAddresses(const std::vector<std::string>& addresses,
                                const std::vector<std::string>& masks, std::vector<CardAddress>& read) {
  read.clear();
  if (addresses.empty() || addresses.size() != masks.size()) return kCardInvalidParameter;
  for (std::size_t i = 0; i < addresses.size(); ++i) {
    const auto address = HostAddress(addresses[i]);
    if (!address) return kCardInvalidAddress;
    const auto prefix = PrefixOf(masks[i]);
    if (!prefix) return kCardInvalidSubnetMask;
    read.push_back({*address, *prefix});
  }
  return kCardChanged;
}

std::uint32_t ReadCardGateway(const std::vector<std::string>& gateways,
                              const std::vector<std::uint16_t>& metrics, CardGateway& read) {
  if (gateways.size() != 1 || metrics.size() > 1) return kCardInvalidParameter;
  const auto address = HostAddress(gateways.front());
  if (!address) return kCardInvalidGateway;
  read = {*address, metrics.empty() ? std::uint16_t{1} : metrics.front()};
  return kCardChanged;
}

} // namespace quendra::platform::linux_
