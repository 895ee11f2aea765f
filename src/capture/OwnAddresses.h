#pragma once

#include "capture/HostAddresses.h"

namespace quendra::capture {

/// The machine's addresses as the capture knows them: read when a page opens, and again when its adapter
/// comes back.
class OwnAddresses {
 public:
  explicit OwnAddresses(const HostAddresses& host) : host_(host) {}

  void Read() {
    LocalAddressLast = host_.LocalHostAddress(HostAddress::Last);
    GatewayAddress = host_.GatewayAddress();
    LocalAddressPrevious = host_.LocalHostAddress(HostAddress::BeforeLast);
  }

  Text LocalAddressLast;
  Text GatewayAddress;
  Text LocalAddressPrevious;

 private:
  const HostAddresses& host_;
};

} // namespace quendra::capture
