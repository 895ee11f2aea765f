#pragma once

#include "platform/capture/CaptureAdapters.h"
#include "platform/windows/capture/CaptureLinks.h"
#include "platform/windows/capture/WpcapLibrary.h"

namespace quendra::platform::windows {

/// The devices of the capture library that are links of this machine. When none is up its first device stands
/// there alone.
class WindowsCaptureAdapters : public CaptureAdapters {
 public:
  WindowsCaptureAdapters(EventLoop& loop, WpcapLibrary library, const IpHelperLibrary& ipHelper)
      : loop_(loop), library_(std::move(library)), ipHelper_(ipHelper) {}

  bool HasLibrary() const override { return library_.IsThere(); }
  bool MayCapture() const override;
  std::vector<LiveAdapter> List() const override;
  unsigned NumberIfUp(const std::string& name) const override;
  Ipv4Address AddressOf(const std::string& name) const override;
  std::unique_ptr<FrameSource> Open(const std::string& name, FrameShaper& shaper) override;
  std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> changed) override;

 private:
  EventLoop& loop_;
  const WpcapLibrary library_;
  const IpHelperLibrary& ipHelper_;
  mutable bool mayCapture_ = false; ///< a process that may, may for good
};

} // namespace quendra::platform::windows
