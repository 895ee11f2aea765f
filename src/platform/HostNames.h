#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace quendra::platform {

/// The host's name and the addresses behind a name.
class HostNames {
 public:
  virtual ~HostNames() = default;

  /// Nothing on failure.
  virtual std::optional<std::string> gethostname() = 0;
  /// The name's IPv4 addresses in the system's order, each as it lies in memory (network order); nothing on
  /// failure.
  virtual std::optional<std::vector<std::uint32_t>> gethostbyname(const std::string& name) = 0;
};

} // namespace quendra::platform
