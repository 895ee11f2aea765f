#include "platform/linux/adapters/KernelCards.h"

#include "platform/adapters/AdapterNumbers.h"
#include "platform/linux/adapters/CardAddresses.h"
#include "platform/linux/adapters/RouteRequests.h"
#include "platform/linux/net/NetworkInterfaces.h"

#include <net/if.h>

#include <cerrno>
#include <map>

namespace quendra::platform::linux_ {

namespace {

std::uint32_t ResultOf(int error) {
  if (error == 0) return kCardChanged;
  return error == EPERM || error == EACCES ? kCardAccessDenied : kCardUnknownFailure;
}

class KernelCard : public NetworkCard {
 public:
  explicit KernelCard(std::string name) : name_(std::move(name)) {}

  std::string Description() override { return "Network adapter (" + name_ + ")"; }
  std::uint32_t EnableStatic(const std::vector<std::string>& addresses,
                             const std::vector<std::string>& masks) override {
    std::vector<CardAddress> read;
    if (const std::uint32_t result = ReadCardAddresses(addresses, masks, read)) return result;
    const RouteRequests requests(::if_nametoindex(name_.c_str()));
    return ResultOf(requests.ReplaceAddresses(read));
  }
  std::uint32_t SetGateways(const std::vector<std::string>& gateways,
                            const std::vector<std::uint16_t>& metrics) override {
    CardGateway read;
    if (const std::uint32_t result = ReadCardGateway(gateways, metrics, read)) return result;
    const RouteRequests requests(::if_nametoindex(name_.c_str()));
    return ResultOf(requests.ReplaceGateway(read));
  }

 private:
  const std::string name_;
};

} // namespace

NetworkCards ReadKernelCards() {
  std::multimap<unsigned, std::string> names; ///< by index
  for (const NetworkInterface& interface : ReadNetworkInterfaces(ProcFolder("/proc")))
    if (!interface.isLoopback && !interface.addresses.empty())
      names.emplace(::if_nametoindex(interface.name.c_str()), interface.name);
  NetworkCards cards;
  for (const auto& [index, name] : names) cards.push_back(std::make_shared<KernelCard>(name));
  return cards;
}

} // namespace quendra::platform::linux_
