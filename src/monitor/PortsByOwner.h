#pragma once

#include "runtime/Text.h"

#include <unordered_map>

namespace quendra::monitor {

/// Ports texts of processes, as a row takes them at its creation: .80.1025. in the order of adding.
class PortsByOwner {
 public:
  void Add(std::uint32_t processId, std::uint32_t port);
  /// Empty for a process without a port.
  Text TextOf(std::uint32_t processId) const;

 private:
  std::unordered_map<std::uint32_t, Text> texts_;
};

} // namespace quendra::monitor
