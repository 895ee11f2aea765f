#pragma once

#include "platform/capture/Capture.h"
#include "runtime/Integers.h"
#include "runtime/Text.h"

#include <memory>

namespace quendra::capture {

/// Capture state that the capture session and the packet attribution share.
struct CaptureFields {
  std::int32_t CaptureInitResult = -1; ///< what VBPcapInit returned
  std::int16_t CurrentAdapter = -1;
  bool CaptureRunning = false;
  Text LocalAddressLast;
  Text GatewayAddress;
  Text LocalAddressPrevious;
  /// The capture control. A handler that has yielded looks here again: an adapter change puts another one in
  /// its place.
  std::unique_ptr<platform::CaptureControl> vpacket;
};

} // namespace quendra::capture
