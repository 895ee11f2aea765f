#pragma once

#include "runtime/Text.h"

#include <array>
#include <cstdint>
#include <span>

namespace quendra::provisioning {

/// An open connection as plain fields, in the order of the platform's record.
struct RasConnectionFields {
  std::uint32_t handle = 0;
  Text entryName{};
  Text deviceType{};
  Text deviceName{};
  Text phoneBook{};
  std::uint32_t subEntry = 0;
  std::array<std::uint8_t, 16> guid{};
};

/// The sizes that the records of connections have had, in the order in which they are tried.
extern const std::array<std::uint32_t, 4> kRasConnectionSizes;

/// The fields that a record of this size has; `record` is one of these sizes.
RasConnectionFields RasConnectionOf(std::span<const std::uint8_t> record);

} // namespace quendra::provisioning
