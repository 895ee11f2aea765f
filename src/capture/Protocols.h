#pragma once

#include "platform/capture/CaptureNumbers.h"
#include "platform/net/IpProtocols.h"

namespace quendra::capture {

// The numbers of the protocols and of the frames' types stand with the machine.
using enum platform::IpProtocol;
using enum platform::FrameType;

/// Where the protocol of a frame's outermost IPv4 header stands.
inline constexpr int kProtocolIndex = 23;
/// From a PPTP tunnel's headers to the packet in it: an IPv4 header (20), GRE with two numbers (16), PPP
/// framing (4).
inline constexpr int kTunnelOffset = 40;

} // namespace quendra::capture
