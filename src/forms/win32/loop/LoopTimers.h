#pragma once

#include "platform/EventLoop.h"
#include "winapi/Winapi.h"

#include <map>
#include <memory>

namespace quendra::forms::win32 {

/// The timers of a loop, which are the system's own on its window.
class LoopTimers {
 public:
  using Tick = std::function<void()>;

  /// `window` gets WM_TIMER with the numbers of the timers.
  void Open(HWND window) { table_->window = window; }
  /// Subscriptions may outlive the loop.
  void Close() { table_->window = nullptr; }
  std::unique_ptr<platform::EventLoop::Subscription> Start(int milliseconds, Tick tick);
  /// What runs at a tick of this timer, the same object each time, so that it keeps what it remembers;
  /// nullptr for one that has ended, of which a tick was on its way.
  std::shared_ptr<const Tick> TickOf(UINT_PTR number) const;

 private:
  struct Table {
    HWND window = nullptr;
    std::map<UINT_PTR, std::shared_ptr<const Tick>> ticks{};
    UINT_PTR last = 0;
  };
  class Running;

  std::shared_ptr<Table> table_ = std::make_shared<Table>();
};

} // namespace quendra::forms::win32
