#pragma once

#include "platform/adapters/Adapters.h"

namespace quendra::platform::windows {

/// The system's management instrumentation.
class WindowsAdapters : public Adapters {
 public:
  std::unique_ptr<ManagementServices> GetObject(const std::string& moniker) override;
};

} // namespace quendra::platform::windows
