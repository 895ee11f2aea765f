#pragma once

#include "platform/adapters/Adapters.h"
#include "platform/linux/network_manager/NetworkManagerBus.h"
#include "platform/linux/network_manager/NetworkSettings.h"

#include <functional>

namespace quendra::platform::linux_ {

/// A card that NetworkManager manages: a change goes into the connection that the device uses, so that it
/// holds, and is applied at once.
class ManagedCard : public NetworkCard {
 public:
  struct Device {
    std::string path;
    std::string interface;
    std::string description;
  };

  ManagedCard(NetworkManagerBus& bus, Device device) : bus_(bus), device_(std::move(device)) {}

  std::string Description() override { return device_.description; }
  std::uint32_t EnableStatic(const std::vector<std::string>& addresses,
                             const std::vector<std::string>& masks) override;
  std::uint32_t SetGateways(const std::vector<std::string>& gateways,
                            const std::vector<std::uint16_t>& metrics) override;

 private:
  std::uint32_t Change(const std::function<void(ValueMap& ipv4)>& change);
  BusValue PropertyOf(const std::string& path, const char* interface, const char* name);
  std::uint32_t Apply(const std::string& connection);

  NetworkManagerBus& bus_;
  const Device device_;
};

} // namespace quendra::platform::linux_
