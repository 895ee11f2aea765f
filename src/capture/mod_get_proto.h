#pragma once

#include "platform/capture/FrameBytes.h"

/// Reads the IPv4 header of a capture record. Only its protocol is ever consumed.
namespace quendra::capture::mod_get_proto {

struct IpHeader {
  std::uint8_t version = 0;
  std::uint8_t headerLength = 0;
  std::uint8_t typeOfService = 0;
  std::int16_t totalLength = 0;    ///< one byte only: the high one when it isn't 0, else the low one
  std::int16_t identification = 0; ///< as the two bytes lie in memory
  std::uint8_t timeToLive = 0;
  std::uint8_t protocol = 0;
  std::uint32_t source = 0; ///< in memory order, as `destination`
  std::uint32_t destination = 0;
};
static_assert(sizeof(IpHeader) == 20);

/// Fault 9 for an array that ends within the header.
IpHeader ReadIpHeader(const platform::FrameBytes& record, std::int32_t index);

} // namespace quendra::capture::mod_get_proto
