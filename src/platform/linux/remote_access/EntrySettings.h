#pragma once

#include "platform/linux/remote_access/LineSettings.h"

#include <vector>

namespace quendra::platform::linux_ {

/// The image of an entry, with its alternate numbers behind the record.
std::vector<std::uint8_t> EntryImageOf(const NetworkSettings& settings, LineKind kind);

/// Puts what an image of RasEntry::kBytes or more tells into a connection's settings; what the image doesn't
/// tell stays. What NetworkManager has no place for goes into the connection's user data. False, with nothing
/// changed, for a device of no kind and for alternate numbers that are longer than user data may be.
bool PutEntryImage(NetworkSettings& settings, std::span<const std::uint8_t> image);

} // namespace quendra::platform::linux_
