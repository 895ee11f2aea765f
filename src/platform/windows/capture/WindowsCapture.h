#pragma once

#include "platform/capture/LiveCapture.h"
#include "platform/windows/capture/WpcapLibrary.h"
#include "platform/windows/net/IpHelperLibrary.h"

namespace quendra::platform::windows {

/// The capture library and its control over wpcap.
class WindowsCapture : public LiveCapture {
 public:
  WindowsCapture(EventLoop& loop, const IpHelperLibrary& ipHelper, WpcapLibrary library = WpcapLibrary());
};

} // namespace quendra::platform::windows
