#pragma once

#include "platform/simulated/remote_access/SimulatedEntry.h"

namespace quendra::platform::simulated {

/// The name in a RasDialParams, whose size is one that systems have had.
std::string EntryNameIn(std::span<const std::uint8_t> params);
/// What follows the name: to an image from what an entry has saved, and back.
void PutDialParameters(const SimulatedEntry& entry, std::span<std::uint8_t> params);
void TakeDialParameters(SimulatedEntry& entry, std::span<const std::uint8_t> params);

} // namespace quendra::platform::simulated
