#pragma once

#include "provisioning/remote_access/RasEntryRecord.h"

#include <span>
#include <vector>

namespace quendra::provisioning {

/// The byte image of an entry on a system whose record has `recordBytes`, the alternate numbers behind it.
/// Fields that this record lacks are left out.
std::vector<std::uint8_t> RasEntryImageOf(const RasEntryRecord& record, std::uint32_t recordBytes);
/// Takes the fields from an image. Those that the record or the image lacks stay as they are.
void TakeRasEntryImage(RasEntryRecord& record, std::span<const std::uint8_t> image,
                       std::uint32_t recordBytes);

} // namespace quendra::provisioning
