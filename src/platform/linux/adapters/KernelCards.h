#pragma once

#include "platform/linux/adapters/ManagedCards.h"

namespace quendra::platform::linux_ {

/// The links that have an address, for a machine without NetworkManager. Root alone can change them, and a
/// change lasts until the next start.
NetworkCards ReadKernelCards();

} // namespace quendra::platform::linux_
