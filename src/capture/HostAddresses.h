#pragma once

#include "platform/Machine.h"
#include "runtime/Text.h"

namespace quendra::capture {

/// The machine's own addresses as dotted texts.
class HostAddresses {
 public:
  explicit HostAddresses(const platform::Machine& machine) : machine_(machine) {}

  /// The last address of the host's own list, or the one before it; empty when there is none or a call fails.
  Text LocalHostAddress(bool last) const;
  /// The first gateway found on any adapter; empty when there is none.
  Text GatewayAddress() const;

 private:
  platform::Machine machine_;
};

} // namespace quendra::capture
