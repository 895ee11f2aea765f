#pragma once

#include "platform/capture/FrameSource.h"
#include "platform/capture/LiveAdapter.h"
#include "platform/net/Ipv4Address.h"

#include <memory>
#include <string>
#include <vector>

namespace quendra::platform {

/// The adapters of a machine. With it and its source of frames a backend has all that LiveCapture asks of a
/// system.
class CaptureAdapters {
 public:
  virtual ~CaptureAdapters() = default;

  /// Whether the system's capture library is there. Without it nothing is listed or opened.
  virtual bool HasLibrary() const = 0;
  /// Whether this process may open a capture.
  virtual bool MayCapture() const = 0;
  /// Those that are up and whose packets can be shown as Ethernet frames, in any order. When there is none,
  /// one that is down may stand there alone, so that there is something to choose until it comes up.
  virtual std::vector<LiveAdapter> List() const = 0;
  /// The system's number for the adapter as long as it is up, otherwise 0. One that is made again under its
  /// name has another number.
  virtual unsigned NumberIfUp(const std::string& name) const = 0;
  /// The adapter's first IPv4 address, 0.0.0.0 for none.
  virtual Ipv4Address AddressOf(const std::string& name) const = 0;
  /// nullptr when the adapter can't be opened. The shaper outlives the source.
  [[nodiscard]] virtual std::unique_ptr<FrameSource> Open(const std::string& name, FrameShaper& shaper) = 0;
  /// Calls `changed` from the loop when an adapter may have come, gone or changed, or its address, until the
  /// subscription goes. What exactly isn't told: whoever is told looks for itself. `changed` may end the
  /// subscription.
  [[nodiscard]] virtual std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> changed) = 0;
};

} // namespace quendra::platform
