#include "forms/headless/HeadlessLoop.h"

#include <algorithm>
#include <stdexcept>

namespace quendra::forms::headless {

std::unique_ptr<platform::EventLoop::Subscription> HeadlessLoop::StartTimer(int milliseconds,
                                                                            std::function<void()> tick) {
  auto alarm = std::make_shared<Alarm>();
  alarm->tick = std::move(tick);
  alarm->period = milliseconds;
  alarm->due = milliseconds < 1 ? -1 : now_ + milliseconds;
  alarm->sequence = ++sequence_;
  std::erase_if(alarms_, [](const auto& old) { return old.expired(); });
  alarms_.push_back(alarm);
  return std::make_unique<SubscriptionTo<Alarm>>(std::move(alarm));
}

void HeadlessLoop::PumpOnce() {
  PumpPosted();
  PumpSources();
}

void HeadlessLoop::RunUntilIdle() {
  constexpr int kMostRounds = 100000;
  for (int round = 0; round < kMostRounds; ++round) {
    PumpPosted();
    if (!PumpSources() && !HasPosted()) return;
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

void HeadlessLoop::PumpPosted() {
  Collect();
  posted_.RunWaiting([this](const PostedWork::Work& work) { Dispatch(work); });
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

} // namespace quendra::forms::headless
