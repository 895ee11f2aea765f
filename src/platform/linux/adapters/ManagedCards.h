#pragma once

#include "platform/adapters/Adapters.h"
#include "platform/linux/network_manager/NetworkManagerBus.h"

#include <memory>
#include <optional>
#include <vector>

namespace quendra::platform::linux_ {

using NetworkCards = std::vector<std::shared_ptr<NetworkCard>>;

/// NetworkManager's devices that have an address. Nothing where it doesn't answer.
std::optional<NetworkCards> ReadManagedCards(NetworkManagerBus& bus);

} // namespace quendra::platform::linux_
