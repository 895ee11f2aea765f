#pragma once

#include "runtime/Text.h"

#include <cstdint>

namespace quendra::provisioning {

/// How an entry of the phone book is dialled, as plain fields in the order of the platform's record.
struct RasDialParamsRecord {
  std::uint32_t size = 0;
  Text entryName{};
  Text phoneNumber{};
  Text callbackNumber{};
  Text userName{};
  Text password{};
  Text domain{};
  std::uint32_t subEntry = 0;
  std::uint32_t callbackId = 0;

  friend bool operator==(const RasDialParamsRecord&, const RasDialParamsRecord&) = default;
};

} // namespace quendra::provisioning
