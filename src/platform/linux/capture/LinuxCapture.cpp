#include "platform/linux/capture/LinuxCapture.h"

#include "platform/linux/capture/LinuxCaptureAdapters.h"

namespace quendra::platform::linux_ {

LinuxCapture::LinuxCapture(EventLoop& loop, DescriptorWatch& descriptors, PcapLibrary library)
    : LiveCapture(loop, std::make_unique<LinuxCaptureAdapters>(descriptors, std::move(library))) {}

} // namespace quendra::platform::linux_
