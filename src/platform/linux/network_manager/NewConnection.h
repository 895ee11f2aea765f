#pragma once

#include "platform/linux/network_manager/NetworkSettings.h"

#include <string>

namespace quendra::platform::linux_ {

/// A connection of no kind yet: under an id of its own, dialled only when it is asked for, and this user's
/// own unless this user is root, so that nobody is asked for a password to change it.
NetworkSettings NewConnection(const std::string& name);

} // namespace quendra::platform::linux_
