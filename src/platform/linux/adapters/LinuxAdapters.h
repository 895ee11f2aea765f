#pragma once

#include "platform/adapters/Adapters.h"
#include "platform/linux/network_manager/NetworkManagerBus.h"

namespace quendra::platform::linux_ {

/// Network cards: NetworkManager's, and without it the kernel's.
class LinuxAdapters : public Adapters {
 public:
  explicit LinuxAdapters(NetworkManagerBus& bus) : bus_(bus) {}

  std::unique_ptr<ManagementServices> GetObject(const std::string& moniker) override;

 private:
  NetworkManagerBus& bus_;
};

} // namespace quendra::platform::linux_
