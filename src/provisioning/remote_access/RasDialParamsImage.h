#pragma once

#include "provisioning/remote_access/RasDialParamsRecord.h"

#include <array>
#include <span>
#include <vector>

namespace quendra::provisioning {

/// The sizes that the dial parameters of systems have had, in the order in which they are tried.
extern const std::array<std::uint32_t, 3> kRasDialParamsSizes;

/// An image of one of these sizes that holds nothing but its size and the entry's name.
std::vector<std::uint8_t> EmptyRasDialParams(std::uint32_t bytes, const Text& entryName);
/// Puts every field into an image of one of these sizes, which stands in it.
void PutRasDialParams(const RasDialParamsRecord& record, std::span<std::uint8_t> image);
/// Takes every field from an image. False for a size that is none of these; fault 9 for an image that has
/// fewer bytes than it says.
bool TakeRasDialParams(RasDialParamsRecord& record, std::span<const std::uint8_t> image);

} // namespace quendra::provisioning
