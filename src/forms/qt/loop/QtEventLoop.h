#pragma once

#include "forms/loop/Dispatcher.h"
#include "forms/loop/PostedWork.h"
#include "forms/loop/PumpGate.h"
#include "platform/EventLoop.h"

#include <QObject>

#include <atomic>
#include <ctime>
#include <mutex>
#include <vector>

namespace quendra::forms::qt {

/// The program's loop over the toolkit's.
class QtEventLoop : public QObject {
 public:
  explicit QtEventLoop(Dispatcher& dispatcher) : dispatcher_(dispatcher) {}

  /// From any thread.
  void Post(std::function<void()> work);
  std::unique_ptr<platform::EventLoop::Subscription> WatchDescriptor(int descriptor,
                                                                     std::function<void()> ready);
  std::unique_ptr<platform::EventLoop::Subscription> StartTimer(int milliseconds, std::function<void()> tick);
  void PumpOnce();

  /// PumpOnce when that can matter.
  void PumpIfDue() {
    if (gate_.IsDue(workArrived_.load(std::memory_order_relaxed) || !posted_.IsEmpty())) PumpOnce();
  }

 protected:
  bool event(QEvent* event) override;

 private:
  /// Nanoseconds, moving with the kernel's tick.
  struct CoarseClock {
    std::int64_t operator()() const {
      timespec now{};
      clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
      return now.tv_sec * 1'000'000'000LL + now.tv_nsec;
    }
  };

  void Collect();

  Dispatcher& dispatcher_;
  std::mutex arrivedLock_;
  std::vector<PostedWork::Work> arrived_;
  std::atomic<bool> workArrived_ = false;
  PostedWork posted_;
  PumpGate<CoarseClock> gate_;
};

} // namespace quendra::forms::qt
