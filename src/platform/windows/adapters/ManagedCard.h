#pragma once

#include "platform/adapters/Adapters.h"
#include "platform/windows/adapters/ComValues.h"

#include <wbemcli.h>

namespace quendra::platform::windows {

/// A card's configuration among the system's managed objects.
class ManagedCard : public NetworkCard {
 public:
  struct Place {
    std::string description;
    Text path;
  };

  ManagedCard(std::shared_ptr<const ComRuntime> com, ComPtr<IWbemServices> services, Place place)
      : com_(std::move(com)), services_(std::move(services)), place_(std::move(place)) {}

  std::string Description() override { return place_.description; }
  std::uint32_t EnableStatic(const std::vector<std::string>& addresses,
                             const std::vector<std::string>& masks) override;
  std::uint32_t SetGateways(const std::vector<std::string>& gateways,
                            const std::vector<std::uint16_t>& metrics) override;

 private:
  struct Argument {
    const wchar_t* name;
    ComValue value;
  };

  /// What the method gives.
  std::uint32_t Run(TextView method, Argument& first, Argument& second);
  HRESULT NewArguments(TextView method, ComPtr<IWbemClassObject>& arguments);
  std::uint32_t Execute(TextView method, IWbemClassObject* arguments);

  const std::shared_ptr<const ComRuntime> com_; ///< outlives what comes from it
  const ComPtr<IWbemServices> services_;
  const Place place_;
};

} // namespace quendra::platform::windows
