#pragma once

#include "forms/loop/Dispatcher.h"
#include "forms/loop/PostedWork.h"
#include "forms/loop/PumpGate.h"
#include "forms/win32/loop/ArrivedWork.h"
#include "forms/win32/loop/LoopTimers.h"

namespace quendra::forms::win32 {

/// Counts the system's ticks, of 10 to 16 milliseconds: some nanoseconds, where a look into the message queue
/// takes microseconds.
struct TickClock {
  std::int64_t operator()() const { return ::GetTickCount(); }
};

/// The loop of the thread's messages.
class Win32EventLoop {
 public:
  /// What is asked about each message before its window gets it: true for one that is done with.
  using Filter = std::function<bool(const MSG&)>;
  /// `afterEach` runs after each message and each round of work, outside of all of them when none is nested.
  Win32EventLoop(Dispatcher& dispatcher, Filter filter, std::function<void()> afterEach);
  ~Win32EventLoop();
  Win32EventLoop(const Win32EventLoop&) = delete;
  Win32EventLoop& operator=(const Win32EventLoop&) = delete;

  /// From any thread.
  void Post(std::function<void()> work);
  std::unique_ptr<platform::EventLoop::Subscription> StartTimer(int milliseconds,
                                                                std::function<void()> tick) {
    return timers_.Start(milliseconds, std::move(tick));
  }
  void PumpOnce();
  void PumpIfDue() {
    if (gate_.IsDue(arrived_.IsWaiting() || !posted_.IsEmpty())) PumpOnce();
  }

  /// Runs until a condition holds, or the loops are to be left: since the number was asked for.
  void RunUntil(const std::function<bool()>& done, unsigned leavings);
  unsigned Leavings() const { return leavings_; }
  void LeaveLoops();

 private:
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;
  void Handle(UINT message, WPARAM wParam);
  void Wake();
  void RunWork();
  /// False when more is left than one pump handles.
  bool HandleMessages();
  void Dispatch(const MSG& message);

  Dispatcher& dispatcher_;
  Filter filter_;
  std::function<void()> afterEach_;
  HWND window_;
  ArrivedWork arrived_;
  PostedWork posted_;
  LoopTimers timers_;
  PumpGate<TickClock> gate_;
  unsigned leavings_ = 0;
  bool inForeignLoop_ = false;
};

} // namespace quendra::forms::win32
