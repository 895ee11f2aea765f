#pragma once

#include "platform/windows/adapters/ManagedCard.h"

namespace quendra::platform::windows {

/// A connection to the system's managed objects.
class Management : public ManagementServices {
 public:
  Management(std::shared_ptr<const ComRuntime> com, ComPtr<IWbemServices> services)
      : com_(std::move(com)), services_(std::move(services)) {}

  std::vector<std::shared_ptr<NetworkCard>> ExecQuery(const std::string& query) override;

 private:
  std::vector<ComPtr<IWbemClassObject>> Objects(const std::string& query);
  Text TextOf(IWbemClassObject& object, const wchar_t* property);

  const std::shared_ptr<const ComRuntime> com_; ///< outlives what comes from it
  const ComPtr<IWbemServices> services_;
};

} // namespace quendra::platform::windows
