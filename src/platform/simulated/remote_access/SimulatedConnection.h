#pragma once

#include "platform/remote_access/Dialling.h"
#include "platform/simulated/remote_access/DialScript.h"

#include <array>
#include <string>

namespace quendra::platform::simulated {

/// A connection from its dial to its hang-up, a failed one too.
struct SimulatedConnection {
  RasConnection handle{};
  std::string entryName{};
  std::string deviceType{};
  std::string deviceName{};
  std::string phoneBook{};
  std::uint32_t subEntry = 0;
  std::array<std::uint8_t, 16> guid{};
  std::uint32_t state = kRasOpenPort;
  Dialling::Notifier notifier{};
  DialScript ahead{}; ///< what is still to come
};

/// Fills a record of a size that systems have had; its size stands in it.
void PutConnection(const SimulatedConnection& connection, std::span<std::uint8_t> record);

} // namespace quendra::platform::simulated
