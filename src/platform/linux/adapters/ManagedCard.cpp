#include "platform/linux/adapters/ManagedCard.h"

#include "platform/adapters/AdapterNumbers.h"
#include "platform/linux/adapters/CardAddresses.h"
#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/linux/network_manager/NewConnection.h"

namespace quendra::platform::linux_ {

namespace {

/// NMActivationStateFlags: what the device has was given to it by others, and no connection is kept of it.
constexpr std::uint64_t kIsExternal = 0x80;

std::uint32_t ResultOf(const BusAnswer& answer) {
  if (answer.IsGiven()) return kCardChanged;
  return answer.IsForbidden() ? kCardAccessDenied : kCardUnknownFailure;
}

BusValue AddressData(const std::vector<CardAddress>& addresses) {
  BusValue list = BusValue::Array("a{sv}", {});
  for (const CardAddress& one : addresses)
    list.items.push_back(ValueOf(ValueMap{{"address", BusValue::Text(one.address.AsAscii())},
                                          {"prefix", BusValue::Number(one.prefix)}}));
  return list;
}

/// The setting of an Ethernet device that has no connection yet.
NetworkSettings NewCardConnection(const std::string& interface) {
  NetworkSettings settings = NewConnection(interface);
  PutText(settings, "connection", "type", "802-3-ethernet");
  PutText(settings, "connection", "interface-name", interface);
  settings["connection"]["autoconnect"] = BusValue::Truth(true);
  settings["802-3-ethernet"];
  return settings;
}

} // namespace

std::uint32_t ManagedCard::EnableStatic(const std::vector<std::string>& addresses,
                                        const std::vector<std::string>& masks) {
  std::vector<CardAddress> read;
  if (const std::uint32_t result = ReadCardAddresses(addresses, masks, read)) return result;
  return Change([&](ValueMap& ipv4) {
    ipv4["method"] = BusValue::Text("manual");
    ipv4["address-data"] = AddressData(read);
    ipv4.erase("addresses"); // the same in its older form
  });
}

std::uint32_t ManagedCard::SetGateways(const std::vector<std::string>& gateways,
                                       const std::vector<std::uint16_t>& metrics) {
  CardGateway read;
  if (const std::uint32_t result = ReadCardGateway(gateways, metrics, read)) return result;
  return Change([&](ValueMap& ipv4) {
    ipv4["gateway"] = BusValue::Text(read.address.AsAscii());
    ipv4["route-metric"] = BusValue::Signed(read.metric);
    ipv4["never-default"] = BusValue::Truth(false);
    ipv4.erase("addresses"); // it has the gateway, too
  });
}

BusValue ManagedCard::PropertyOf(const std::string& path, const char* interface, const char* name) {
  const auto answer =
      bus_.Ask({path, nm::kProperties, "Get", {BusValue::Text(interface), BusValue::Text(name)}});
  return answer.First().items.empty() ? BusValue() : answer.First().items.front();
}

std::uint32_t ManagedCard::Change(const std::function<void(ValueMap& ipv4)>& change) {
  const std::string active = PropertyOf(device_.path, nm::kDevice, "ActiveConnection").text;
  if (active.empty()) return kCardUnknownFailure;
  if (active == nm::kNoObject) {
    NetworkSettings settings = NewCardConnection(device_.interface);
    change(settings["ipv4"]);
    return ResultOf(bus_.AskForChange(
        {nm::kManagerPath,
         nm::kManager,
         "AddAndActivateConnection",
         {ValueOf(settings), BusValue::Path(device_.path), BusValue::Path(nm::kNoObject)}}));
  }
  const std::string connection = PropertyOf(active, nm::kActive, "Connection").text;
  const auto answer = bus_.Ask({connection, nm::kConnection, "GetSettings"});
  if (!answer.IsGiven()) return ResultOf(answer);
  NetworkSettings settings = NetworkSettingsOf(answer.First());
  if (PropertyOf(active, nm::kActive, "StateFlags").number & kIsExternal)
    settings["connection"]["autoconnect"] = BusValue::Truth(true);
  change(settings["ipv4"]);
  if (const auto updated = bus_.AskForChange({connection, nm::kConnection, "Update", {ValueOf(settings)}});
      !updated.IsGiven())
    return ResultOf(updated);
  return Apply(connection);
}

std::uint32_t ManagedCard::Apply(const std::string& connection) {
  const auto reapplied =
      bus_.AskForChange({device_.path,
                         nm::kDevice,
                         "Reapply",
                         {ValueOf(NetworkSettings()), BusValue::Wide(0), BusValue::Number(0)}});
  if (reapplied.IsGiven()) return kCardChanged;
  // Some changes are made by beginning anew only.
  return ResultOf(bus_.AskForChange(
      {nm::kManagerPath,
       nm::kManager,
       "ActivateConnection",
       {BusValue::Path(connection), BusValue::Path(device_.path), BusValue::Path(nm::kNoObject)}}));
}

} // namespace quendra::platform::linux_
