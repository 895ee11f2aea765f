#pragma once

#include "forms/loop/Dispatcher.h"
#include "forms/loop/PostedWork.h"
#include "forms/loop/PumpGate.h"
#include "platform/EventLoop.h"

#include <QObject>

#include <atomic>
#include <mutex>
#include <vector>

namespace quendra::forms::qt {

/// The program's loop over the toolkit's.
class QtEventLoop : public QObject {
 public:
  explicit QtEventLoop(Dispatcher& dispatcher);

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
  void Collect();

  Dispatcher& dispatcher_;
  std::mutex arrivedLock_;
  std::vector<PostedWork::Work> arrived_;
  std::atomic<bool> workArrived_ = false;
  PostedWork posted_;
  PumpGate gate_;
};

} // namespace quendra::forms::qt
