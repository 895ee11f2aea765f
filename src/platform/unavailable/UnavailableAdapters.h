#pragma once

#include "platform/adapters/Adapters.h"
#include "runtime/Fault.h"

namespace quendra::platform::unavailable {

/// A system whose network cards nobody manages.
class UnavailableAdapters : public Adapters {
 public:
  std::unique_ptr<ManagementServices> GetObject(const std::string&) override {
    throw Fault(Fault::kCannotCreateObject);
  }
};

} // namespace quendra::platform::unavailable
