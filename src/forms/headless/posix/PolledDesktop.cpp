#include "forms/headless/posix/PolledDesktop.h"

#include <poll.h>

#include <algorithm>
#include <chrono>

namespace quendra::forms::headless {

void PolledDesktop::Post(std::function<void()> work) {
  const std::lock_guard guard(arrivedLock_);
  arrived_.push_back(std::move(work));
}

void PolledDesktop::Collect() {
  const std::lock_guard guard(arrivedLock_);
  for (auto& work : arrived_) PostHere(std::move(work));
  arrived_.clear();
}

std::unique_ptr<platform::EventLoop::Subscription>
PolledDesktop::WatchDescriptor(int descriptor, std::function<void()> ready) {
  const std::shared_ptr<Watch> watch(new Watch{descriptor, std::move(ready)});
  watches_.push_back(watch);
  return std::make_unique<SubscriptionTo<Watch>>(watch);
}

bool PolledDesktop::WaitFor(const std::function<bool()>& condition, int realMilliseconds) {
  using Clock = std::chrono::steady_clock;
  const auto start = Clock::now();
  const std::int64_t clockAtStart = Now();
  for (;;) {
    const auto passed = std::chrono::duration_cast<std::chrono::milliseconds>(Clock::now() - start).count();
    Advance(static_cast<int>(std::max<std::int64_t>(0, clockAtStart + passed - Now())));
    if (condition()) return true;
    if (passed >= realMilliseconds) return false;
    PumpDescriptors(HasPosted() ? 0 : 2);
  }
}

bool PolledDesktop::PumpDescriptors(int realMilliseconds) {
  std::erase_if(watches_, [](const auto& watch) { return watch.expired(); });
  const auto watches = watches_;
  std::vector<pollfd> polled;
  for (const auto& watch : watches) polled.push_back({watch.lock()->descriptor, POLLIN, 0});
  if (polled.empty() && realMilliseconds == 0) return false;
  if (poll(polled.data(), polled.size(), realMilliseconds) <= 0) return false;
  bool any = false;
  for (std::size_t i = 0; i < polled.size(); ++i) {
    if (polled[i].revents == 0) continue;
    // The subscription may have gone in a handler before this one.
    if (const auto watch = watches[i].lock()) {
      any = true;
      Dispatch(watch->ready);
    }
  }
  return any;
}

} // namespace quendra::forms::headless
