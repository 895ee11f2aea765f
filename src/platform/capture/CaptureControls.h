#pragma once

#include "platform/capture/CaptureControl.h"

#include <memory>

namespace quendra::platform {

/// Makes capture controls.
class CaptureControls {
 public:
  virtual ~CaptureControls() = default;
  /// Fault 429 when the control's class isn't registered.
  virtual std::unique_ptr<CaptureControl> Create() = 0;
};

} // namespace quendra::platform
