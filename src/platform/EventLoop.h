#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace quendra::platform {

/// The one loop from which events come, implemented by the desktop. Handlers run on its thread, one at a
/// time; only a handler that pumps lets others run inside it.
class EventLoop {
 public:
  virtual ~EventLoop() = default;

  /// A watch or timer, which ends when this object is destroyed.
  class Subscription {
   public:
    virtual ~Subscription() = default;
  };

  /// Runs `work` from the loop, after what is posted already. May be called from any thread.
  virtual void Post(std::function<void()> work) = 0;
  /// Queues a window message after what is posted already: window, message, wParam, lParam. May be called
  /// from any thread. A loop without windows loses it, as one for a window that has gone is lost.
  virtual void PostMessage(WindowHandle /*window*/, std::uint32_t /*message*/, std::uint32_t /*wParam*/,
                           std::uint32_t /*lParam*/) {}
  /// The number of the window messages of that name, the same for whoever asks; 0 on failure.
  virtual std::uint32_t RegisterWindowMessageA(const std::string& /*name*/) { return 0; }
  /// Each tick runs the object that was handed over, no copy of it: it keeps what it remembers.
  [[nodiscard]] virtual std::unique_ptr<Subscription> StartTimer(int milliseconds,
                                                                 std::function<void()> tick) = 0;
  /// Handles what waits, without waiting for more.
  virtual void PumpOnce() = 0;
  /// How many message boxes and modal forms stand, one over the other. Each handles events in a loop of its
  /// own while the handler that opened it waits. A handler that finds the number above that of its own start
  /// in what runs inside it knows that it is held up by one of them, and not merely pumping.
  virtual int ModalDepth() const = 0;
};

} // namespace quendra::platform
