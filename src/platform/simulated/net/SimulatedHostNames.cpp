#include "platform/simulated/net/SimulatedHostNames.h"

#include "platform/simulated/SimulatedCore.h"

#include <algorithm>

namespace quendra::platform::simulated {

bool SimulatedHostNames::IsOwn(Ipv4Address address) const {
  if (address.IsAny() || address.IsLoopback()) return true;
  return std::any_of(Addresses.begin(), Addresses.end(),
                     [&](const std::string& own) { return AddressOf(own) == address; });
}

Ipv4Address SimulatedHostNames::OwnAddressTowards(Ipv4Address address) const {
  if (IsOwn(address)) return address;
  return Addresses.empty() ? AddressOf("10.0.0.7") : AddressOf(Addresses.back());
}

std::optional<std::string> SimulatedHostNames::gethostname() {
  lastError_ = FailName ? Error : 0;
  if (FailName) return {};
  return Name;
}

std::optional<std::vector<Ipv4Address>> SimulatedHostNames::gethostbyname(const std::string& name) {
  const auto other = others_.find(CutText(name));
  const bool isKnown = !FailAddresses && (other != others_.end() || CutText(name) == Name);
  std::vector<Ipv4Address> addresses;
  if (isKnown)
    for (const auto& address : other == others_.end() ? Addresses : other->second)
      addresses.push_back(AddressOf(address));
  lastError_ = addresses.empty() ? Error : 0;
  if (addresses.empty()) return {};
  return addresses;
}

} // namespace quendra::platform::simulated
