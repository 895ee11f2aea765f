#pragma once

#include "platform/linux/network_manager/NetworkManagerBus.h"
#include "platform/linux/remote_access/LineSettings.h"

#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// What the machine can dial with: PPPoE where NetworkManager manages an Ethernet link, a VPN where the PPTP
/// plugin is installed, of which a file in that folder tells. The error number of NetworkManager's answer.
std::uint32_t ReadRemoteDevices(NetworkManagerBus& bus, const std::string& pluginFolder,
                                std::vector<LineKind>& devices);

} // namespace quendra::platform::linux_
