#pragma once

#include "platform/net/Ipv4Address.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// An address and how many bits of it are the network's.
struct CardAddress {
  Ipv4Address address;
  std::uint32_t prefix = 0;

  friend bool operator==(const CardAddress&, const CardAddress&) = default;
};

struct CardGateway {
  Ipv4Address address;
  std::uint16_t metric = 0;
};

/// Each gives a NetworkCardResult.
std::uint32_t ReadCardAddresses(const std::vector<std::string>& addresses,
                                const std::vector<std::string>& masks, std::vector<CardAddress>& read);
/// One gateway only, as a card has one way out.
std::uint32_t ReadCardGateway(const std::vector<std::string>& gateways,
                              const std::vector<std::uint16_t>& metrics, CardGateway& read);

} // namespace quendra::platform::linux_
