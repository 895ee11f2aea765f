#pragma once

#include "platform/linux/adapters/CardAddresses.h"
#include "platform/linux/system/Descriptor.h"

#include <cstdint>
#include <vector>

namespace quendra::platform::linux_ {

/// Changes of a link's addresses and routes, asked of the kernel. Each gives 0 or the system's error number.
class RouteRequests {
 public:
  explicit RouteRequests(unsigned link);

  int ReplaceAddresses(const std::vector<CardAddress>& addresses) const;
  int ReplaceGateway(const CardGateway& gateway) const;

 private:
  int ReadAddresses(std::vector<CardAddress>& addresses) const;

  const unsigned link_;
  const Descriptor socket_;
};

} // namespace quendra::platform::linux_
