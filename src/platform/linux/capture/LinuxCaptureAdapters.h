#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/capture/CaptureAdapters.h"
#include "platform/linux/capture/PcapLibrary.h"

namespace quendra::platform::linux_ {

/// The network interfaces. When none is up loopback stands there alone.
class LinuxCaptureAdapters : public CaptureAdapters {
 public:
  LinuxCaptureAdapters(DescriptorWatch& descriptors, PcapLibrary library)
      : descriptors_(descriptors), library_(std::move(library)) {}

  bool HasLibrary() const override { return library_.IsThere(); }
  bool MayCapture() const override;
  std::vector<LiveAdapter> List() const override;
  unsigned NumberIfUp(const std::string& name) const override;
  Ipv4Address AddressOf(const std::string& name) const override;
  std::unique_ptr<FrameSource> Open(const std::string& name, FrameShaper& shaper) override;
  std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> changed) override;

 private:
  DescriptorWatch& descriptors_;
  const PcapLibrary library_;
};

} // namespace quendra::platform::linux_
