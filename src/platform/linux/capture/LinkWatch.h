#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/linux/system/Descriptor.h"

#include <functional>
#include <memory>

namespace quendra::platform::linux_ {

/// Tells through the loop that an interface of this network namespace may have come, gone or changed, or its
/// IPv4 address. What exactly isn't told: whoever is told looks for itself, so that no message that the
/// kernel had no room for is missed. Without the means to watch it stays silent.
class LinkWatch : public EventLoop::Subscription {
 public:
  LinkWatch(DescriptorWatch& descriptors, std::function<void()> changed);

 private:
  Descriptor socket_;
  std::unique_ptr<EventLoop::Subscription> watch_; // goes before the socket
};

} // namespace quendra::platform::linux_
