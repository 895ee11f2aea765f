#include "platform/simulated/adapters/SimulatedAdapters.h"

namespace quendra::platform::simulated {

class SimulatedAdapters::Card : public NetworkCard {
 public:
  Card(Core& core, std::string description, std::uint32_t result)
      : core_(core), description_(std::move(description)), result_(result) {}

  std::string Description() override { return description_; }
  std::uint32_t EnableStatic(const std::vector<std::string>& addresses,
                             const std::vector<std::string>& masks) override {
    std::string call = "EnableStatic " + description_;
    for (std::size_t i = 0; i < addresses.size(); ++i)
      call += " " + addresses[i] + "/" + (i < masks.size() ? masks[i] : "");
    core_.calls.push_back(call);
    return result_;
  }
  std::uint32_t SetGateways(const std::vector<std::string>& gateways,
                            const std::vector<std::uint16_t>& metrics) override {
    std::string call = "SetGateways " + description_;
    for (std::size_t i = 0; i < gateways.size(); ++i)
      call += " " + gateways[i] + (i < metrics.size() ? " metric " + std::to_string(metrics[i]) : "");
    core_.calls.push_back(call);
    return result_;
  }

 private:
  Core& core_;
  std::string description_;
  std::uint32_t result_;
};

class SimulatedAdapters::Services : public ManagementServices {
 public:
  explicit Services(SimulatedAdapters& adapters) : adapters_(adapters) {}

  std::vector<std::shared_ptr<NetworkCard>> ExecQuery(const std::string& query) override {
    adapters_.core_.calls.push_back("ExecQuery " + query);
    std::vector<std::shared_ptr<NetworkCard>> cards;
    for (const auto& description : adapters_.Cards)
      cards.push_back(std::make_shared<Card>(adapters_.core_, description, adapters_.Result));
    return cards;
  }

 private:
  SimulatedAdapters& adapters_;
};

std::unique_ptr<ManagementServices> SimulatedAdapters::GetObject(const std::string& moniker) {
  core_.calls.push_back("GetObject " + moniker);
  if (!HasManagement) throw Fault(Fault::kCannotCreateObject);
  return std::make_unique<Services>(*this);
}

} // namespace quendra::platform::simulated
