#pragma once

#include "forms/qt/loop/Dispatcher.h"
#include "platform/EventLoop.h"

#include <QObject>

#include <atomic>
#include <ctime>
#include <deque>
#include <mutex>

namespace quendra::forms::qt {

/// The program's loop over the toolkit's.
class QtEventLoop : public QObject {
 public:
  explicit QtEventLoop(Dispatcher& dispatcher) : dispatcher_(dispatcher) {}

  void Post(std::function<void()> work);
  std::unique_ptr<platform::EventLoop::Subscription> WatchDescriptor(int descriptor,
                                                                     std::function<void()> ready);
  std::unique_ptr<platform::EventLoop::Subscription> StartTimer(int milliseconds, std::function<void()> tick);
  void PumpOnce();

  /// PumpOnce when that can matter. Handlers yield after every captured frame, some hundred thousand times a
  /// second, while asking the toolkit costs microseconds even when nothing waits. So work posted from within
  /// the program is seen by a flag, and what comes from outside (the user, descriptors, timers) is looked for
  /// when the kernel's coarse clock has moved on, every few milliseconds: reading that clock costs some
  /// nanoseconds, and nobody sees the delay.
  void PumpIfDue() {
    if (!posted_.load(std::memory_order_relaxed) && CoarseNow() == lastPump_) return;
    PumpOnce();
  }

 protected:
  bool event(QEvent* event) override;

 private:
  static std::int64_t CoarseNow() {
    timespec now{};
    clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
    return now.tv_sec * 1'000'000'000LL + now.tv_nsec;
  }
  void RunPosted();

  Dispatcher& dispatcher_;
  std::mutex mutex_;
  std::deque<std::function<void()>> queue_;
  std::atomic<bool> posted_ = false;
  std::int64_t lastPump_ = 0;
};

} // namespace quendra::forms::qt
