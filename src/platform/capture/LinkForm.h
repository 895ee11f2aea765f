#pragma once

#include <optional>

namespace quendra::platform {

/// How the packets of a link begin.
enum class LinkForm { Ethernet, RawIp, Family, LinuxCooked, LinuxCooked2, Ppp };

/// The numbers that capture libraries have for types of links, the same on each system.
namespace link_type {
inline constexpr int kFamily = 0;
inline constexpr int kEthernet = 1;
inline constexpr int kPpp = 9;
inline constexpr int kRawIp = 12;
inline constexpr int kSerialPpp = 50;
inline constexpr int kBigFamily = 108;
inline constexpr int kLinuxCooked = 113;
inline constexpr int kRawIpv4 = 228;
inline constexpr int kRawIpv6 = 229;
inline constexpr int kLinuxCooked2 = 276;
} // namespace link_type

/// Nothing for a type of link whose packets cannot be shown as Ethernet frames.
std::optional<LinkForm> LinkFormOf(int linkType);

/// In the language of capture libraries, what an event can charge or pass over: IPv4 with TCP, fragments too,
/// or with a tunnel. Anything else would end a drain, or keep it from beginning when it came last, so that
/// the table starved beside the datagrams of a call or a game.
const char* CaptureFilterOf(LinkForm form);

} // namespace quendra::platform
