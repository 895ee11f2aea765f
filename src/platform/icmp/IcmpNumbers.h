#pragma once

#include <cstddef>
#include <cstdint>

/// The published numbers of the ICMP helper: the status of an echo, and where the fields of its two records
/// lie in their 32-bit layout.
namespace quendra::platform {

enum EchoStatus : std::uint32_t {
  kEchoSuccess = 0,
  kEchoNetUnreachable = 11002,
  kEchoHostUnreachable = 11003,
  kEchoProtocolUnreachable = 11004,
  kEchoPortUnreachable = 11005,
  kEchoNoResources = 11006,
  kEchoPacketTooBig = 11009,
  kEchoTimedOut = 11010,
  kEchoBadRequest = 11011,
  kEchoTtlExpiredInTransit = 11013,
  kEchoTtlExpiredInReassembly = 11014,
  kEchoParameterProblem = 11015,
  kEchoBadDestination = 11018,
  kEchoGeneralFailure = 11050,
};

/// IP_OPTION_INFORMATION. The pointer to further options is 0: nobody sends any.
inline constexpr std::size_t kEchoOptionsSize = 8;
enum EchoOptionsField : std::size_t { kOptionsTtl = 0, kOptionsTos = 1, kOptionsFlags = 2 };

/// ICMP_ECHO_REPLY. The data that came back lies behind it in the buffer, as far as there is room; the
/// pointer to it is 0. Its options are those of the reply as it came.
inline constexpr std::size_t kEchoReplySize = 28;
enum EchoReplyField : std::size_t {
  kReplyAddress = 0,
  kReplyStatus = 4,
  kReplyRoundTripTime = 8,
  kReplyDataSize = 12,
  kReplyTtl = 20, ///< the first field of its options
  kReplyTos = 21,
};

} // namespace quendra::platform
