#pragma once

#include "platform/linux/capture/PcapLibrary.h"
#include "platform/net/Ipv4Address.h"

#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A network interface that frames can be captured from.
struct CaptureAdapter {
  std::string name;        ///< the system's name, such as "eth0"
  std::string description; ///< UTF-8, such as "Ethernet (eth0)"
};

/// The interfaces that are up and whose packets can be shown as Ethernet frames: the one of the default route
/// first, loopback last, so that the first adapter with the host's address is the one that a subscriber
/// means. When none is up loopback stands there alone.
std::vector<CaptureAdapter> ListCaptureAdapters(const PcapLibrary& library);

/// The interface's first IPv4 address, 0.0.0.0 for none.
Ipv4Address AddressOfAdapter(const std::string& name);

/// The kernel's number for the interface as long as it is up, otherwise 0. One that is made again under its
/// name has another number.
unsigned NumberOfAdapterThatIsUp(const std::string& name);

/// Whether this process may open a capture.
bool MayCapture();

} // namespace quendra::platform::linux_
