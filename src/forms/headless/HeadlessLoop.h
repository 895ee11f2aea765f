#pragma once

#include "forms/loop/PostedWork.h"
#include "platform/EventLoop.h"

#include <cstdint>
#include <vector>

namespace quendra::forms::headless {

/// The loop of a program under test, on any system: posted work waits until it is pumped and timers follow a
/// clock that the test moves. One thread.
class HeadlessLoop : public platform::EventLoop {
 public:
  void Post(std::function<void()> work) override { PostHere(std::move(work)); }
  std::unique_ptr<Subscription> StartTimer(int milliseconds, std::function<void()> tick) override;
  /// What was posted before the call.
  void PumpOnce() override;

  /// Pumps until nothing waits. More than 100,000 rounds raise std::runtime_error: the work never ends.
  void RunUntilIdle();
  /// Moves the clock on. Timers tick in the order of their times; what they post runs before the clock moves
  /// further.
  void Advance(int milliseconds);
  /// Milliseconds since the loop was made.
  std::int64_t Now() const { return now_; }

  /// Runs what an event brings, as the desktop's dispatcher does.
  virtual void Dispatch(const std::function<void()>& work) = 0;

 protected:
  /// Holds what the loop itself only knows weakly.
  template <typename Held> class SubscriptionTo : public Subscription {
   public:
    explicit SubscriptionTo(std::shared_ptr<Held> held) : held_(std::move(held)) {}

   private:
    std::shared_ptr<Held> held_;
  };

  // For a loop that hears of more than its own thread tells it.

  /// Posts what others left for this thread.
  virtual void Collect() {}
  /// Handles each other source of events once; true when one had something.
  virtual bool PumpSources() { return false; }
  void PostHere(std::function<void()> work) { posted_.Add(std::move(work)); }
  bool HasPosted() {
    Collect();
    return !posted_.IsEmpty();
  }

 private:
  /// One timer: `due` below 0 means that it stands still.
  struct Alarm {
    std::int64_t due = -1;
    std::uint64_t sequence = 0;
    int period = 0;
    std::function<void()> tick;
  };

  void PumpPosted();
  std::shared_ptr<Alarm> NextAlarm(std::int64_t until);

  PostedWork posted_;
  std::vector<std::weak_ptr<Alarm>> alarms_;
  std::int64_t now_ = 0;
  std::uint64_t sequence_ = 0;
};

} // namespace quendra::forms::headless
