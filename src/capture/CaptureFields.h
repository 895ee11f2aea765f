#pragma once

#include "runtime/Integers.h"
#include "runtime/Text.h"

namespace quendra::capture {

/// Capture state that the capture session and the packet attribution share.
struct CaptureFields {
  std::int32_t CaptureInitResult = -1;  ///< what VBPcapInit returned
  std::int16_t CurrentAdapter = -1;
  bool CaptureRunning = false;
  Text LocalAddressLast;
  Text GatewayAddress;
  Text LocalAddressPrevious;
};

} // namespace quendra::capture
