#pragma once

#include "platform/adapters/Adapters.h"
#include "platform/simulated/SimulatedCore.h"
#include "runtime/Fault.h"

namespace quendra::platform::simulated {

/// Network cards as a list of descriptions. What is done to them stands in the machine's Calls, as in
/// "EnableStatic First card 10.0.0.1/255.0.0.0" and "SetGateways First card 10.0.0.138 metric 1".
class SimulatedAdapters : public Adapters {
 public:
  explicit SimulatedAdapters(Core& core) : core_(core) {}

  std::vector<std::string> Cards;
  bool HasManagement = true;
  /// What both operations of a card give.
  std::uint32_t Result = 0;

  std::unique_ptr<ManagementServices> GetObject(const std::string& moniker) override;

 private:
  class Card;
  class Services;

  Core& core_;
};

} // namespace quendra::platform::simulated
