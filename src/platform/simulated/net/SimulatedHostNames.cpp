#include "platform/simulated/net/SimulatedHostNames.h"

#include "platform/simulated/SimulatedCore.h"

namespace quendra::platform::simulated {

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
