#pragma once

#include "platform/DescriptorWatch.h"

#include <cstdint>
#include <deque>
#include <mutex>
#include <vector>

namespace quendra::forms {

/// The loop of a program under test: posted work waits until it is pumped and timers follow a clock that the
/// test moves.
class HeadlessLoop : public platform::EventLoop, public platform::DescriptorWatch {
 public:
  void Post(std::function<void()> work) override;
  std::unique_ptr<Subscription> WatchDescriptor(int descriptor, std::function<void()> ready) override;
  std::unique_ptr<Subscription> StartTimer(int milliseconds, std::function<void()> tick) override;
  /// What was posted before the call, then each descriptor that can be read, once.
  void PumpOnce() override;

  /// Pumps until nothing waits. More than 100,000 rounds raise std::runtime_error: the work never ends.
  void RunUntilIdle();
  /// Moves the clock on. Timers tick in the order of their times; what they post runs before the clock moves
  /// further.
  void Advance(int milliseconds);
  /// For real descriptors and threads: pumps, with the clock following real time, until the condition holds.
  /// False when it doesn't hold in time.
  bool WaitFor(const std::function<bool()>& condition, int realMilliseconds);

  /// Milliseconds since the loop was made.
  std::int64_t Now() const { return now_; }

  /// Runs what an event brings, as the desktop's dispatcher does.
  virtual void Dispatch(const std::function<void()>& work) = 0;

 protected:
  /// One timer: `due` below 0 means that it stands still.
  struct Alarm {
    std::int64_t due = -1;
    std::uint64_t sequence = 0;
    int period = 0;
    std::function<void()> tick;
  };
  std::shared_ptr<Alarm> AddAlarm(std::function<void()> tick);
  /// A period below 1 stops it.
  void SetAlarm(Alarm& alarm, int period);

 private:
  class Watch;

  bool HasPosted();
  bool PumpPosted();
  bool PumpDescriptors(int realMilliseconds);
  std::shared_ptr<Alarm> NextAlarm(std::int64_t until);

  std::mutex postedLock_;
  std::deque<std::function<void()>> posted_;
  std::vector<std::weak_ptr<Watch>> watches_;
  std::vector<std::weak_ptr<Alarm>> alarms_;
  std::int64_t now_ = 0;
  std::uint64_t sequence_ = 0;
};

} // namespace quendra::forms
