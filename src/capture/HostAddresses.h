#pragma once

#include "platform/net/HostNames.h"
#include "platform/net/IpHelper.h"
#include "runtime/Text.h"

namespace quendra::capture {

/// Which of the host's own list of addresses.
enum class HostAddress { Last, BeforeLast };

/// The machine's own addresses as dotted texts.
class HostAddresses {
 public:
  HostAddresses(platform::HostNames& hostNames, platform::IpHelper& ipHelper)
      : hostNames_(hostNames), ipHelper_(ipHelper) {}

  /// Empty when there is none or a call fails.
  Text LocalHostAddress(HostAddress which) const;
  /// The first gateway found on any adapter; empty when there is none.
  Text GatewayAddress() const;

 private:
  platform::HostNames& hostNames_;
  platform::IpHelper& ipHelper_;
};

} // namespace quendra::capture
