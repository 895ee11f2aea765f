#pragma once

#include "platform/net/Ipv4Address.h"

#include <cstdint>
#include <span>
#include <vector>

namespace quendra::platform {

/// What answered an echo, as plain fields.
struct EchoReply {
  Ipv4Address address;
  std::uint32_t status = 0;
  std::uint32_t roundTripTime = 0;
  std::uint8_t ttl = 0; ///< that the reply had left
  std::uint8_t tos = 0;
  std::vector<std::uint8_t> data;
};

/// Writes the record and, behind it, as much of the data as there is room for. False, and nothing is written,
/// when there is no room for the record.
bool PutEchoReply(std::span<std::uint8_t> buffer, const EchoReply& reply);
/// The record without a reply: a status alone.
bool PutEchoFailure(std::span<std::uint8_t> buffer, std::uint32_t status);

} // namespace quendra::platform
