#pragma once

#include "platform/net/HostNames.h"
#include "platform/net/SocketNumbers.h"

namespace quendra::platform::unavailable {

/// A host without a name and without name servers.
class UnavailableHostNames : public HostNames {
 public:
  std::optional<std::string> gethostname() override { return {}; }
  std::optional<std::vector<Ipv4Address>> gethostbyname(const std::string&) override { return {}; }
  std::int32_t LastError() override { return kSubsystemUnavailable; }
};

} // namespace quendra::platform::unavailable
