#pragma once

#include "platform/net/InterfaceRow.h"
#include "platform/net/Ipv4Address.h"
#include "platform/windows/net/IpHelperLibrary.h"
#include "runtime/Text.h"

#include <string>
#include <vector>

namespace quendra::platform::windows {

/// What the IP helper tells of an adapter; its loopback is none. An address that isn't set is 0.0.0.0.
struct ListedCard {
  std::string name; ///< such as "{4D36E972-E325-11CE-BFC1-08002BE10318}"
  Text description;
  std::uint32_t index = 0;
  std::uint32_t kind = 0; ///< as InterfaceKind
  std::vector<Ipv4Address> addresses;
  std::vector<Ipv4Address> gateways;
};

/// In the system's order. 0, or the reason why there is no list.
std::uint32_t ReadNetworkCards(const IpHelperLibrary& library, std::vector<ListedCard>& cards);

/// The rows of the interface table. 0, or the reason why there are none.
std::uint32_t ReadInterfaceRows(const IpHelperLibrary& library, bool sorted, std::vector<InterfaceRow>& rows);

} // namespace quendra::platform::windows
