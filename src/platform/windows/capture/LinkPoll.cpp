#include "platform/windows/capture/LinkPoll.h"

namespace quendra::platform::windows {

LinkPoll::LinkPoll(EventLoop& loop, Read read, std::function<void()> changed) {
  auto last = read();
  timer_ = loop.StartTimer(kMilliseconds, [read = std::move(read), changed = std::move(changed),
                                           last = std::move(last)]() mutable {
    auto now = read();
    if (!now || now == last) return;
    last = std::move(now);
    changed();
  });
}

} // namespace quendra::platform::windows
