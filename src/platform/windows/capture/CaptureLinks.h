#pragma once

#include "platform/windows/net/NetworkCards.h"

#include <optional>

namespace quendra::platform::windows {

/// An interface of this machine whose packets can be shown as Ethernet frames.
struct CaptureLink {
  std::string name; ///< as the capture library's names end in it
  Text description;
  std::uint32_t index = 0;
  Ipv4Address address; ///< its first, 0.0.0.0 for none
  bool isUp = false;
  bool isDialUp = false;
  bool isLoopback = false;
  bool hasDefaultRoute = false;
  friend bool operator==(const CaptureLink&, const CaptureLink&) = default;
};

/// From what the IP helper's tables tell; `routed` is the index of the interface of the default route, 0 for
/// none.
std::vector<CaptureLink> CaptureLinksOf(const std::vector<ListedCard>& cards,
                                        const std::vector<InterfaceRow>& rows, std::uint32_t routed);
/// None where the system can't tell just now.
std::optional<std::vector<CaptureLink>> ReadCaptureLinks(const IpHelperLibrary& library);

/// That of one of the capture library's devices; nullptr for a device that is none of this machine's links.
const CaptureLink* LinkOfDevice(const std::vector<CaptureLink>& links, std::string_view device);

} // namespace quendra::platform::windows
