#include "forms/headless/HeadlessLoop.h"

#include <poll.h>

#include <algorithm>
#include <chrono>
#include <stdexcept>

namespace quendra::forms {

namespace {

template <typename Held> class SubscriptionTo : public platform::EventLoop::Subscription {
 public:
  explicit SubscriptionTo(std::shared_ptr<Held> held) : held_(std::move(held)) {}

 private:
  std::shared_ptr<Held> held_;
};

} // namespace

class HeadlessLoop::Watch {
 public:
  Watch(int descriptor_, std::function<void()> ready_) : descriptor(descriptor_), ready(std::move(ready_)) {}

  const int descriptor;
  const std::function<void()> ready;
};

void HeadlessLoop::Post(std::function<void()> work) {
  const std::lock_guard guard(postedLock_);
  posted_.push_back(std::move(work));
}

std::unique_ptr<platform::EventLoop::Subscription>
HeadlessLoop::WatchDescriptor(int descriptor, std::function<void()> ready) {
  auto watch = std::make_shared<Watch>(descriptor, std::move(ready));
  watches_.push_back(watch);
  return std::make_unique<SubscriptionTo<Watch>>(std::move(watch));
}

std::unique_ptr<platform::EventLoop::Subscription> HeadlessLoop::StartTimer(int milliseconds,
                                                                            std::function<void()> tick) {
  auto alarm = AddAlarm(std::move(tick));
  SetAlarm(*alarm, milliseconds);
  return std::make_unique<SubscriptionTo<Alarm>>(std::move(alarm));
}

void HeadlessLoop::PumpOnce() {
  PumpPosted();
  PumpDescriptors(0);
}

void HeadlessLoop::RunUntilIdle() {
  constexpr int kMostRounds = 100000;
  for (int round = 0; round < kMostRounds; ++round) {
    const bool posted = PumpPosted();
    const bool read = PumpDescriptors(0);
    if (!posted && !read) return;
  }
  throw std::runtime_error("the loop never becomes idle");
}

void HeadlessLoop::Advance(int milliseconds) {
  const std::int64_t until = now_ + milliseconds;
  PumpOnce();
  while (const auto alarm = NextAlarm(until)) {
    now_ = std::max(now_, alarm->due);
    alarm->due += alarm->period;
    alarm->sequence = ++sequence_;
    Dispatch(alarm->tick);
    PumpOnce();
  }
  now_ = std::max(now_, until);
}

bool HeadlessLoop::WaitFor(const std::function<bool()>& condition, int realMilliseconds) {
  using Clock = std::chrono::steady_clock;
  const auto start = Clock::now();
  const std::int64_t clockAtStart = now_;
  for (;;) {
    const auto passed = std::chrono::duration_cast<std::chrono::milliseconds>(Clock::now() - start).count();
    Advance(static_cast<int>(std::max<std::int64_t>(0, clockAtStart + passed - now_)));
    if (condition()) return true;
    if (passed >= realMilliseconds) return false;
    PumpDescriptors(HasPosted() ? 0 : 2);
  }
}

std::shared_ptr<HeadlessLoop::Alarm> HeadlessLoop::AddAlarm(std::function<void()> tick) {
  auto alarm = std::make_shared<Alarm>();
  alarm->tick = std::move(tick);
  std::erase_if(alarms_, [](const auto& old) { return old.expired(); });
  alarms_.push_back(alarm);
  return alarm;
}

void HeadlessLoop::SetAlarm(Alarm& alarm, int period) {
  alarm.period = period;
  alarm.due = period < 1 ? -1 : now_ + period;
  alarm.sequence = ++sequence_;
}

bool HeadlessLoop::HasPosted() {
  const std::lock_guard guard(postedLock_);
  return !posted_.empty();
}

bool HeadlessLoop::PumpPosted() {
  std::unique_lock guard(postedLock_);
  // Work that a handler posts waits for the next pump; a handler that pumps itself runs the ones behind it.
  for (std::size_t left = posted_.size(); left > 0 && !posted_.empty(); --left) {
    const auto work = std::move(posted_.front());
    posted_.pop_front();
    guard.unlock();
    Dispatch(work);
    guard.lock();
    if (left == 1) return true;
  }
  return false;
}

bool HeadlessLoop::PumpDescriptors(int realMilliseconds) {
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

std::shared_ptr<HeadlessLoop::Alarm> HeadlessLoop::NextAlarm(std::int64_t until) {
  std::shared_ptr<Alarm> next;
  for (const auto& entry : alarms_) {
    const auto alarm = entry.lock();
    if (!alarm || alarm->due < 0 || alarm->due > until) continue;
    const auto earlier = [](const Alarm& a, const Alarm& b) {
      return a.due != b.due ? a.due < b.due : a.sequence < b.sequence;
    };
    if (!next || earlier(*alarm, *next)) next = alarm;
  }
  return next;
}

} // namespace quendra::forms
