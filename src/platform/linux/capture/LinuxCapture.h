#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/capture/LiveCapture.h"
#include "platform/linux/capture/PcapLibrary.h"

namespace quendra::platform::linux_ {

/// The capture library and its control over libpcap.
class LinuxCapture : public LiveCapture {
 public:
  LinuxCapture(EventLoop& loop, DescriptorWatch& descriptors, PcapLibrary library = PcapLibrary());
};

} // namespace quendra::platform::linux_
