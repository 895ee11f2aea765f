#pragma once

#include "platform/capture/CaptureControls.h"
#include "platform/unavailable/UnavailableCaptureControl.h"

namespace quendra::platform::unavailable {

/// Its controls can be made, as the control's class comes with the program: without one the main window does
/// not open (fault 429), and a system that is being brought up would show nothing at all.
class UnavailableCaptureControls : public CaptureControls {
 public:
  std::unique_ptr<CaptureControl> Create() override { return std::make_unique<UnavailableCaptureControl>(); }
};

} // namespace quendra::platform::unavailable
