#pragma once

#include <functional>
#include <memory>

namespace quendra::platform {

/// The one loop from which events come, implemented by the desktop. Handlers run on its thread, one at a time save that a
/// handler that pumps lets others run inside it.
class EventLoop {
 public:
  virtual ~EventLoop() = default;

  /// Ends what it stands for when it goes.
  class Subscription {
   public:
    virtual ~Subscription() = default;
  };

  /// Runs `work` from the loop, behind what is posted already. May be called from any thread.
  virtual void Post(std::function<void()> work) = 0;
  /// Calls `ready` whenever the descriptor can be read, again as long as it can.
  [[nodiscard]] virtual std::unique_ptr<Subscription> WatchDescriptor(int descriptor, std::function<void()> ready) = 0;
  [[nodiscard]] virtual std::unique_ptr<Subscription> StartTimer(int milliseconds, std::function<void()> tick) = 0;
  /// Handles what waits, without waiting for more.
  virtual void PumpOnce() = 0;
};

} // namespace quendra::platform
