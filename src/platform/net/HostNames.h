#pragma once

#include "platform/net/Ipv4Address.h"

#include <optional>
#include <string>
#include <vector>

namespace quendra::platform {

/// The host's own name, and the addresses of names. These questions have an error of their own: what sockets
/// do in between neither sets nor hides it.
class HostNames {
 public:
  virtual ~HostNames() = default;

  /// Nothing on failure.
  virtual std::optional<std::string> gethostname() = 0;
  /// The name's IPv4 addresses, at least one, in the system's order; nothing on failure.
  virtual std::optional<std::vector<Ipv4Address>> gethostbyname(const std::string& name) = 0;
  /// Why the last of these questions failed, as the socket library numbers it; 0 when it was answered.
  virtual std::int32_t LastError() = 0;
};

} // namespace quendra::platform
