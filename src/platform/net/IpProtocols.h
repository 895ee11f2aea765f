#pragma once

namespace quendra::platform {

/// Protocol numbers of IPv4 headers.
enum IpProtocol : int { kIcmp = 1, kTcp = 6, kUdp = 17, kGre = 47 };

} // namespace quendra::platform
