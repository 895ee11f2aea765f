#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// Dial parameters in any of their sizes as the longest one, which alone has room for everything.
///
/// 0 for an image that has one of the sizes and is whole.
std::uint32_t ErrorOfDialParams(std::span<const std::uint8_t> params);
std::string EntryNameOf(std::span<const std::uint8_t> params);
/// Writes into `full`, an image of RasDialParams::kBytes, what `params` has room for.
void TakeDialParams(std::span<const std::uint8_t> params, std::span<std::uint8_t> full);
/// Writes everything behind the entry's name that `params` has room for.
void GiveDialParams(std::span<const std::uint8_t> full, std::span<std::uint8_t> params);

} // namespace quendra::platform::linux_
