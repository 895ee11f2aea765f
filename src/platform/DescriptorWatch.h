#pragma once

#include "platform/EventLoop.h"

namespace quendra::platform {

/// Watching descriptors, on systems that have them: a loop of such a system offers it beside EventLoop, and
/// only a backend that holds a descriptor asks for it.
class DescriptorWatch {
 public:
  virtual ~DescriptorWatch() = default;

  /// Calls `ready` whenever the descriptor can be read, again as long as it can.
  [[nodiscard]] virtual std::unique_ptr<EventLoop::Subscription>
  WatchDescriptor(int descriptor, std::function<void()> ready) = 0;
};

} // namespace quendra::platform
