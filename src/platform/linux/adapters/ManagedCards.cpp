#include "platform/linux/adapters/ManagedCards.h"

#include "platform/linux/adapters/ManagedCard.h"
#include "platform/linux/network_manager/NetworkManagerNames.h"

#include <net/if.h>

#include <algorithm>
#include <tuple>

namespace quendra::platform::linux_ {

namespace {

struct Device {
  std::string path;
  std::string interface;
  std::uint64_t type = 0;
  std::string addresses; ///< the object that tells them
  unsigned index = 0;    ///< the kernel's, as it was when the device was read

  /// The order of their indexes, and in another network namespace that in which they came.
  auto Order() const { return std::tuple(index, path.size(), path); }
};

std::vector<BusAnswer> AskForAll(NetworkManagerBus& bus, const std::vector<std::string>& paths,
                                 const char* interface) {
  std::vector<BusQuestion> questions;
  for (const std::string& path : paths)
    questions.push_back({path, nm::kProperties, "GetAll", {BusValue::Text(interface)}});
  return bus.AskAll(questions);
}

std::vector<Device> ReadDevices(NetworkManagerBus& bus, const BusValue& listed) {
  std::vector<std::string> paths;
  for (const BusValue& path : listed.items) paths.push_back(path.text);
  const auto answers = AskForAll(bus, paths, nm::kDevice);
  std::vector<Device> devices;
  for (std::size_t i = 0; i < paths.size(); ++i) {
    ValueMap properties = ValueMapOf(answers[i].First());
    const std::string addresses = properties["Ip4Config"].text;
    const std::uint64_t type = properties["DeviceType"].number;
    const std::string interface = properties["Interface"].text;
    if (type != nm::kLoopback && !addresses.empty() && addresses != nm::kNoObject)
      devices.push_back({paths[i], interface, type, addresses, ::if_nametoindex(interface.c_str())});
  }
  return devices;
}

std::string DescriptionOf(const Device& device) {
  const bool isEthernet = device.type == nm::kEthernet || device.type == nm::kVeth;
  const char* kind = isEthernet ? "Ethernet" : device.type == nm::kWifi ? "Wi-Fi" : "Network adapter";
  return std::string(kind) + " (" + device.interface + ")";
}

} // namespace

std::optional<NetworkCards> ReadManagedCards(NetworkManagerBus& bus) {
  const auto answer = bus.Ask({nm::kManagerPath, nm::kManager, "GetDevices"});
  if (!answer.IsGiven()) return {};
  auto devices = ReadDevices(bus, answer.First());
  std::ranges::sort(devices, {}, &Device::Order);
  std::vector<std::string> paths;
  for (const Device& device : devices) paths.push_back(device.addresses);
  const auto addresses = AskForAll(bus, paths, nm::kIp4Config);
  NetworkCards cards;
  for (std::size_t i = 0; i < devices.size(); ++i)
    if (!ValueMapOf(addresses[i].First())["AddressData"].items.empty() &&
        !devices[i].interface.starts_with("lo:") && devices[i].interface != "lo")
      cards.push_back(std::make_shared<ManagedCard>(
          bus, ManagedCard::Device{devices[i].path, devices[i].interface, DescriptionOf(devices[i])}));
  return cards;
}

} // namespace quendra::platform::linux_
