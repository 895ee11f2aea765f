#pragma once

namespace quendra::capture {

/// Protocol numbers of IPv4 headers.
enum IpProtocol : int { kIcmp = 1, kTcp = 6, kUdp = 17, kGre = 47 };

/// Where the protocol of a frame's outermost IPv4 header stands.
inline constexpr int kProtocolIndex = 23;
/// From a PPTP tunnel's headers to the packet in it: an IPv4 header (20), GRE with two numbers (16), PPP
/// framing (4).
inline constexpr int kTunnelOffset = 40;

/// Type codes of frames.
enum FrameType : int { kIpv4Frame = 2048, kArpFrame = 2054 };

} // namespace quendra::capture
