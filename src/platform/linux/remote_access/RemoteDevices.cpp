#include "platform/linux/remote_access/RemoteDevices.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/linux/remote_access/ConnectionBook.h"
#include "platform/linux/system/Files.h"
#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>
#include <filesystem>

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kMostPluginBytes = 64 * 1024;

bool TellsOfPptp(const std::string& path) {
  const auto text = ReadFile(path, kMostPluginBytes);
  if (!text) return false;
  const auto lines = Split(*text, '\n');
  return std::ranges::find(lines, std::string("service=") + nm::kPptpService) != lines.end();
}

bool HasPptpPlugin(const std::string& folder) {
  std::error_code failure;
  std::filesystem::directory_iterator file(folder, failure);
  for (; !failure && file != std::filesystem::directory_iterator(); file.increment(failure))
    if (file->path().extension() == ".name" && TellsOfPptp(file->path())) return true;
  return false;
}

bool IsManagedEthernet(const BusAnswer& device) {
  ValueMap properties = ValueMapOf(device.First());
  const std::uint64_t type = properties["DeviceType"].number;
  return (type == nm::kEthernet || type == nm::kVeth) && properties["State"].number > nm::kUnmanaged;
}

} // namespace

std::uint32_t ReadRemoteDevices(NetworkManagerBus& bus, const std::string& pluginFolder,
                                std::vector<LineKind>& devices) {
  devices.clear();
  const auto answer = bus.Ask({nm::kManagerPath, nm::kManager, "GetDevices"});
  if (!answer.IsGiven()) return ErrorOf(answer);
  std::vector<BusQuestion> questions;
  for (const BusValue& path : answer.First().items)
    questions.push_back({path.text, nm::kProperties, "GetAll", {BusValue::Text(nm::kDevice)}});
  if (std::ranges::any_of(bus.AskAll(questions), IsManagedEthernet)) devices.push_back(LineKind::Pppoe);
  if (HasPptpPlugin(pluginFolder)) devices.push_back(LineKind::Vpn);
  return kRasSuccess;
}

} // namespace quendra::platform::linux_
