#pragma once

#include "platform/linux/process/ProcFolder.h"
#include "platform/net/Ipv4Address.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// A default route as the kernel lists it.
struct DefaultRoute {
  std::string interface;
  Ipv4Address gateway; ///< 0.0.0.0 for a route without one
  std::uint32_t metric = 0;
};

/// The default routes in a text such as that of /proc/net/route, the preferred one first. Lines that are no
/// such lines are left out.
std::vector<DefaultRoute> ParseDefaultRoutes(std::string_view text);

/// Those of this network namespace.
std::vector<DefaultRoute> ReadDefaultRoutes(const ProcFolder& folder);

} // namespace quendra::platform::linux_
