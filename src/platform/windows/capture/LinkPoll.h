#pragma once

#include "platform/EventLoop.h"
#include "platform/windows/capture/CaptureLinks.h"

#include <functional>
#include <memory>

namespace quendra::platform::windows {

/// Tells through the loop that a link has come, gone or changed, or its address. The system would tell a
/// thread that waits; a look every second costs less. A look that fails tells nothing; the first that
/// succeeds after none has is a change, for who asked before has seen no link.
class LinkPoll : public EventLoop::Subscription {
 public:
  using Read = std::function<std::optional<std::vector<CaptureLink>>()>;

  LinkPoll(EventLoop& loop, Read read, std::function<void()> changed);

  static constexpr int kMilliseconds = 1000;

 private:
  std::unique_ptr<EventLoop::Subscription> timer_;
};

} // namespace quendra::platform::windows
